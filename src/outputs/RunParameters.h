#pragma once

#include <QString>

namespace pelmar {

// A number typed into a layout box, read as the classic integer conversion reads it: blanks
// around it allowed, a fraction rounded to the nearest whole number (halves to even). Throws
// Failure naming the box (caption) when the text is not a number or lies outside min..max.
int wholeNumberIn(const QString& text, const QString& caption, int min, int max);

}  // namespace pelmar

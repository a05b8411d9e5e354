#pragma once

#include "common/SessionState.h"

#include <QString>
#include <QStringList>

#include <optional>

namespace pelmar {

class SettingsStore;

using LabelDefTable = std::array<LabelDefRec, 13>;

// 1 saves all thirteen styles to sections "LabelDef0".."LabelDef12" (keys Font, FontSize,
// FontWeight, FontUL, FontItalic, and FixedText for lines 11 and 12); 2 loads them with the
// defaults Arial, 9 points, normal. A stored value that is not a whole number 0..255 leaves its
// field as it was; a key that cannot be written is skipped. Every action ends by copying line 3's
// style to line 6, since the department is printed inside the contact line.
void SetGetLabelDefs(unsigned char action, SettingsStore& store, LabelDefTable& defs);

// The two CSS rules of label line i: " .L<i> {...}" right-to-left, then " .LE<i> {...}".
QStringList labelStyleRules(int line, const LabelDefRec& style);

// A text as the unsigned 8-bit value 0..255; std::nullopt when it is not one.
std::optional<unsigned char> byteValue(const QString& text);

}  // namespace pelmar

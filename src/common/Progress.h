#pragma once

#include <QString>

namespace pelmar {

// Where a run reports how far it has come: the text of its current step and the share of its
// recipients done, 0 to 1. A run reports 0 when it ends, which clears the display.
class ProgressSink {
public:
    virtual ~ProgressSink() = default;
    virtual void report(const QString& text, double fraction) = 0;
};

}  // namespace pelmar

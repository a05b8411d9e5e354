#pragma once

#include "common/Failure.h"

#include <QString>

#include <functional>

namespace pelmar::test {

// The description of the Failure the work throws; "<no failure>" when it throws none. A test
// that compares it with the message it expects shows that the failure came from the check it
// means, not from an earlier one.
inline QString failureOf(const std::function<void()>& work)
{
    try {
        work();
    } catch (const Failure& failure) {
        return failure.description();
    }
    return QStringLiteral("<no failure>");
}

}  // namespace pelmar::test

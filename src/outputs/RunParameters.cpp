#include "outputs/RunParameters.h"

#include "common/Failure.h"

#include <QLocale>

#include <cmath>

using namespace Qt::StringLiterals;

namespace pelmar {

int wholeNumberIn(const QString& text, const QString& caption, int min, int max)
{
    bool ok = false;
    const double number = QLocale::c().toDouble(text.trimmed(), &ok);
    if (!ok || !std::isfinite(number))
        throw Failure(u"הערך \"%1\" בשדה \"%2\" אינו מספר. יש לתקן אותו ולהפעיל שוב."_s.arg(text, caption), 13);
    const double rounded = std::nearbyint(number);
    if (rounded < min || rounded > max)
        throw Failure(
            u"הערך %1 בשדה \"%2\" מחוץ לתחום המותר: %3 עד %4."_s.arg(text.trimmed(), caption).arg(min).arg(max), 6);
    return static_cast<int>(rounded);
}

}  // namespace pelmar

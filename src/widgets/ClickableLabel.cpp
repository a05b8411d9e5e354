#include "widgets/ClickableLabel.h"

#include <QApplication>
#include <QMouseEvent>

namespace pelmar {

void ClickableLabel::mouseReleaseEvent(QMouseEvent* event)
{
    const bool secondOfDouble = sinceClick_.isValid() && sinceClick_.elapsed() < QApplication::doubleClickInterval();
    if (event->button() == Qt::LeftButton && rect().contains(event->position().toPoint()) && !secondOfDouble) {
        sinceClick_.start();
        emit clicked();
    } else if (!secondOfDouble) {
        sinceClick_.invalidate();
    }
    QLabel::mouseReleaseEvent(event);
}

void ClickableLabel::mouseDoubleClickEvent(QMouseEvent* event)
{
    if (event->button() == Qt::LeftButton)
        emit doubleClicked();
    QLabel::mouseDoubleClickEvent(event);
}

}  // namespace pelmar

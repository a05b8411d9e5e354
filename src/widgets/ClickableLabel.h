#pragma once

#include <QElapsedTimer>
#include <QLabel>

namespace pelmar {

// A label that reports clicks and double clicks. A double click is one click, then the double
// click: the second press of a double click is not a second click.
class ClickableLabel : public QLabel {
    Q_OBJECT
public:
    using QLabel::QLabel;

signals:
    void clicked();
    void doubleClicked();

protected:
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;

private:
    QElapsedTimer sinceClick_;
};

}  // namespace pelmar

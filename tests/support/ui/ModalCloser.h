#pragma once

#include <QApplication>
#include <QDialog>
#include <QTimer>

#include <functional>

namespace pelmar::test {

// While it lives, hands every modal dialog that is open to handle (by default: reject it), so a
// test can press a button that shows a dialog modally without ever waiting on it.
class ModalCloser {
public:
    explicit ModalCloser(std::function<void(QDialog&)> handle = [](QDialog& dialog) { dialog.reject(); })
    {
        QObject::connect(&timer_, &QTimer::timeout, [handle] {
            if (auto* dialog = qobject_cast<QDialog*>(QApplication::activeModalWidget()))
                handle(*dialog);
        });
        timer_.start(10);
    }

private:
    QTimer timer_;
};

}  // namespace pelmar::test

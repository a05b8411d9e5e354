#pragma once

#include <QList>
#include <QObject>

class QWidget;

namespace pelmar {

struct MailingOptions;
struct OptionBinding;

// Keeps the page controls and the options model in step, through the binding table: what the
// user changes on a page goes into the options at once, and show() puts the options on the
// pages (after they were loaded). Every option of the table must have its control on the pages;
// a missing one is a programming error and stops the program.
class OptionsBinder : public QObject {
    Q_OBJECT
public:
    OptionsBinder(QWidget& pages, MailingOptions& options);

    void show();

private:
    struct Bound {
        const OptionBinding* binding;
        QWidget* control;
    };

    void follow(const Bound& bound);
    void showOne(const Bound& bound);

    MailingOptions& options_;
    QList<Bound> bound_;
    bool showing_ = false;
};

}  // namespace pelmar

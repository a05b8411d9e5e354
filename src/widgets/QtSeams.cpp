#include "widgets/QtSeams.h"

#include "common/Failure.h"

#include <QApplication>
#include <QFileDialog>
#include <QFileInfo>
#include <QMessageBox>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

QMessageBox::StandardButton show(QWidget* parent, QMessageBox::Icon icon, const QString& title, const QString& text,
                                 QMessageBox::StandardButtons buttons)
{
    QMessageBox box(icon, title.isEmpty() ? QApplication::applicationName() : title, text, buttons, parent);
    box.setLayoutDirection(Qt::RightToLeft);
    return static_cast<QMessageBox::StandardButton>(box.exec());
}

}  // namespace

bool QtMessages::question(const QString& title, const QString& text)
{
    return show(parent_, QMessageBox::Question, title, text, QMessageBox::Yes | QMessageBox::No) == QMessageBox::Yes;
}

void QtMessages::information(const QString& title, const QString& text)
{
    show(parent_, QMessageBox::Information, title, text, QMessageBox::Ok);
}

void QtMessages::critical(const QString& title, const QString& text)
{
    show(parent_, QMessageBox::Critical, title, text, QMessageBox::Ok);
}

void QtMessages::exclamation(const QString& text)
{
    show(parent_, QMessageBox::Warning, {}, text, QMessageBox::Ok);
}

void QtMessages::plain(const QString& text)
{
    show(parent_, QMessageBox::NoIcon, {}, text, QMessageBox::Ok);
}

QStringList qtFilters(const QString& classicFilter)
{
    const QStringList parts = classicFilter.split(u'|');
    QStringList filters;
    for (qsizetype i = 0; i + 1 < parts.size(); i += 2) {
        // A classic label shows its patterns itself; the Qt dialog adds them again.
        QString label = parts.at(i);
        const qsizetype shown = label.lastIndexOf(u" ("_s);
        if (shown > 0 && label.endsWith(u')'))
            label.truncate(shown);
        // "*.*" means every file there, but on Linux it would hide the files without a suffix.
        QStringList patterns = parts.at(i + 1).split(u';', Qt::SkipEmptyParts);
        patterns.replaceInStrings(u"*.*"_s, u"*"_s);
        filters << label + u" ("_s + patterns.join(u' ') + u')';
    }
    return filters;
}

QString QtFileDialogs::openFile(const QString& filter, int filterIndex)
{
    const QStringList filters = qtFilters(filter);
    QString selected = filters.value(filterIndex - 1, filters.value(0));
    return QFileDialog::getOpenFileName(parent_, {}, {}, filters.join(u";;"_s), &selected,
                                        QFileDialog::DontResolveSymlinks);
}

QString QtFileDialogs::saveFile(const QString& filter, int filterIndex, const QString& defaultName)
{
    const QStringList filters = qtFilters(filter);
    QString selected = filters.value(filterIndex - 1, filters.value(0));
    QString start = defaultName;
    // The dialog itself asks before replacing a file; creating one is asked here, and No goes
    // back to the dialog, as a dialog that asks before creating does.
    for (;;) {
        const QString path = QFileDialog::getSaveFileName(parent_, {}, start, filters.join(u";;"_s), &selected);
        if (path.isEmpty() || QFileInfo::exists(path))
            return path;
        const QString title = parent_ ? parent_->window()->windowTitle() : QString();
        if (show(parent_, QMessageBox::Question, title, u"הקובץ %1 אינו קיים. ליצור אותו?"_s.arg(path),
                 QMessageBox::Yes | QMessageBox::No)
            == QMessageBox::Yes)
            return path;
        start = path;
    }
}

}  // namespace pelmar

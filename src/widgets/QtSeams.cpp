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
    for (qsizetype i = 0; i + 1 < parts.size(); i += 2)
        filters << parts.at(i) + u" ("_s + QString(parts.at(i + 1)).replace(u';', u' ') + u')';
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
    // The dialog itself asks before replacing a file; creating one is asked here.
    const QString path = QFileDialog::getSaveFileName(parent_, {}, defaultName, filters.join(u";;"_s), &selected);
    if (path.isEmpty() || QFileInfo::exists(path))
        return path;
    const auto answer = QMessageBox::question(parent_, QApplication::applicationName(),
                                              u"הקובץ %1 אינו קיים. ליצור אותו?"_s.arg(path));
    return answer == QMessageBox::Yes ? path : QString();
}

}  // namespace pelmar

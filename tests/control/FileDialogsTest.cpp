#include "support/Isolated.h"
#include "support/ui/ModalCloser.h"
#include "widgets/QtSeams.h"

#include <QAbstractButton>
#include <QDir>
#include <QFileDialog>
#include <QMessageBox>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

class FileDialogsTest : public Isolated {};

TEST_F(FileDialogsTest, EachFilterShowsItsLabelOnceAndAllFilesListsFilesWithoutASuffix)
{
    EXPECT_EQ(qtFilters(u"All Files (*.*)|*.*|HTML Files (*.htm,*.html)|*.htm;*.html|Word Files (*.doc)|*.doc"_s),
              (QStringList{u"All Files (*)"_s, u"HTML Files (*.htm *.html)"_s, u"Word Files (*.doc)"_s}));
    writeFile(path(u"README"_s), "x");
    writeFile(path(u"list.txt"_s), "x");
    // The patterns a Qt dialog takes from a filter: those in its last parentheses.
    const QString all = qtFilters(u"All Files (*.*)|*.*"_s).front();
    const QString patterns = all.mid(all.lastIndexOf(u'(') + 1).chopped(1);
    EXPECT_EQ(QDir(folder()).entryList(QDir::nameFiltersFromString(patterns), QDir::Files),
              (QStringList{u"list.txt"_s, u"README"_s}));
}

TEST_F(FileDialogsTest, NoToCreatingTheFileGoesBackToTheSaveDialog)
{
    const QString wanted = path(u"numbers.txt"_s);
    QStringList seen;
    const ModalCloser driver([&](QDialog& dialog) {
        if (auto* box = qobject_cast<QMessageBox*>(&dialog)) {
            seen << u"question: "_s + box->text();
            EXPECT_EQ(box->layoutDirection(), Qt::RightToLeft);
            box->button(QMessageBox::No)->click();
            return;
        }
        auto* files = qobject_cast<QFileDialog*>(&dialog);
        ASSERT_NE(files, nullptr);
        seen << u"dialog"_s;
        if (seen.size() > 2)
            return dialog.reject();
        files->selectFile(wanted);
        QMetaObject::invokeMethod(files, "accept");
    });
    QtFileDialogs dialogs;
    EXPECT_EQ(dialogs.saveFile(u"Text Files (*.txt)|*.txt|All Files (*.*)|*.*"_s, 1, u"smslist"_s), QString());
    EXPECT_EQ(seen,
              (QStringList{u"dialog"_s, u"question: הקובץ %1 אינו קיים. ליצור אותו?"_s.arg(wanted), u"dialog"_s}));
}

}  // namespace
}  // namespace pelmar::test

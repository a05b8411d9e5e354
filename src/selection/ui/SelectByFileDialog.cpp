#include "selection/ui/SelectByFileDialog.h"

#include "common/Failure.h"
#include "common/FileDialogs.h"
#include "common/Messages.h"
#include "common/SessionState.h"
#include "selection/PickerData.h"
#include "selection/SelectedCards.h"
#include "settings/SettingsStore.h"
#include "widgets/SetGetCtrl.h"
#include "widgets/Widgets.h"

#include <QApplication>
#include <QCheckBox>
#include <QFileInfo>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QStyle>
#include <QToolButton>
#include <QVBoxLayout>

using namespace Qt::StringLiterals;

namespace pelmar {

SelectByFileDialog::SelectByFileDialog(Services services, SessionState& state, QWidget* parent)
    : QDialog(parent), services_(services), state_(state)
{
    setObjectName(u"frmSelectByFile"_s);
    setWindowTitle(u"בחירת כרטיסים ע\"פ קובץ חיצוני"_s);
    buildControls();
    SetGetImportParams(kLoad);
}

void SelectByFileDialog::buildControls()
{
    Label1 = caption(u"סימון כרטיסים מקובץ המכיל את את קודי הכרטיסים המבוקשים:"_s, u"Label1"_s);
    txtFileName = textBox(u"txtFileName"_s);
    txtFileName->setLayoutDirection(Qt::LeftToRight);
    auto* pick = new QToolButton;
    pick->setObjectName(u"CmdDir"_s);
    pick->setIcon(QApplication::style()->standardIcon(QStyle::SP_DirOpenIcon));
    connect(pick, &QToolButton::clicked, this, &SelectByFileDialog::CmdDir_Click);
    txtTabNum = textBox(u"txtTabNum"_s);
    ChkIgnoreFirstLine = checkBox(u"ChkIgnoreFirstLine"_s);
    Msg1 = caption(u"לבחירת קובץ, קליק על התיקיה הצהובה..."_s, u"Msg1"_s);
    QPushButton* read = button(u"cmdReadFile"_s, u"קרא את הקובץ"_s);
    QPushButton* ok = button(u"cmdOK"_s, u"אישור"_s);
    QPushButton* close = button(u"cmdClose"_s, u"ביטול"_s);
    connect(read, &QPushButton::clicked, this, &SelectByFileDialog::cmdReadFile_Click);
    connect(ok, &QPushButton::clicked, this, &SelectByFileDialog::cmdOK_Click);
    connect(close, &QPushButton::clicked, this, &SelectByFileDialog::cmdClose_Click);

    auto* grid = new QGridLayout;
    grid->addWidget(caption(u"קובץ:"_s), 0, 0);
    grid->addWidget(txtFileName, 0, 1);
    grid->addWidget(pick, 0, 2);
    grid->addWidget(caption(u"קוד כרטיס בעמודה מספר:"_s), 1, 0);
    grid->addWidget(txtTabNum, 1, 1);
    grid->addWidget(caption(u"להתעלם מהשורה הראשונה בקובץ?"_s), 2, 0);
    grid->addWidget(ChkIgnoreFirstLine, 2, 1);
    auto* buttons = new QHBoxLayout;
    buttons->addWidget(read);
    buttons->addStretch(1);
    buttons->addWidget(ok);
    buttons->addWidget(close);
    auto* layout = new QVBoxLayout(this);
    layout->addWidget(Label1);
    layout->addLayout(grid);
    layout->addWidget(Msg1);
    layout->addLayout(buttons);
}

void SelectByFileDialog::SetGetImportParams(unsigned char action)
{
    const QList<std::tuple<QString, QObject*, unsigned char, QString>> keys
        = {{u"FileName"_s, txtFileName, kPropText, u"c:\\results.txt"_s},
           {u"TabNum"_s, txtTabNum, kPropText, u"2"_s},
           {u"IgnoreFirstLine"_s, ChkIgnoreFirstLine, kPropValue, u"1"_s}};
    for (const auto& [key, control, prop, fallback] : keys) {
        try {
            SetGetCtrl(action, services_.settings, kPelmarApp, u"ImportFile"_s, key, control, prop, fallback);
        } catch (const Failure&) {
            // A key that cannot be read or written is passed over; the next one follows.
        }
    }
}

void SelectByFileDialog::CmdDir_Click()
{
    txtFileName->setText(services_.files.openFile(u"Excel Text Files (*.txt)|*.txt|All Files (*.*)|*.*"_s, 1));
}

void SelectByFileDialog::cmdReadFile_Click()
{
    Msg1->setText(u"קורא את הקובץ. נא להמתין..."_s);
    if (ReadCardsFromFile())
        services_.messages.information(u"הודעה"_s, u"קריאת הקובץ הסתיימה בהצלחה"_s);
}

bool SelectByFileDialog::ReadCardsFromFile()
{
    if (!QFileInfo(txtFileName->text()).isFile()) {
        services_.messages.critical(u"תקלה"_s, u"הקובץ אינו נמצא"_s);
        Msg1->setText(u"הקובץ אינו נמצא. נא לבדוק שוב.."_s);
        return false;
    }
    fileCrd_.clear();
    try {
        fileCrd_
            = readCardFile(txtFileName->text(), cardFileColumn(txtTabNum->text()), ChkIgnoreFirstLine->isChecked());
    } catch (const Failure& failure) {
        services_.messages.critical(u"תקלה"_s, failure.description());
        Msg1->setText(u"תקלה בקריאת הקובץ"_s);
        return false;
    }
    Msg1->setText(u"קריאת הקובץ הסתיימה בהצלחה. נמצאו "_s + QString::number(fileCrd_.size()) + u" כרטיסים"_s);
    return true;
}

void SelectByFileDialog::cmdOK_Click()
{
    SetGetImportParams(kSave);
    if (!fileCrd_.isEmpty())
        replaceSelectedCards(state_, fileCrd_);
    accept();
}

}  // namespace pelmar

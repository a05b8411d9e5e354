#include "db/ui/LogonDialog.h"

#include "common/Failure.h"
#include "common/Messages.h"
#include "common/SessionState.h"
#include "db/CompanyList.h"
#include "db/DatabaseClient.h"
#include "settings/SettingsStore.h"
#include "widgets/SetGetCtrl.h"
#include "widgets/Widgets.h"

#include <QComboBox>
#include <QGridLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QVBoxLayout>

using namespace Qt::StringLiterals;

namespace pelmar {

LogonDialog::LogonDialog(Services services, SessionState& state, QWidget* parent)
    : QDialog(parent), services_(services), state_(state)
{
    setObjectName(u"frmLogon"_s);
    setWindowTitle(u"Connect to SAP Business One"_s);
    setModal(true);
    buildControls();
    txtConnServer->setText(state_.ConnServer);
    txtConnUID->setText(state_.ConnUID);
    txtConnPWD->setText(state_.ConnPWD);
    txtConnDatabase->setText(state_.ConnDataBase);
}

void LogonDialog::buildControls()
{
    QGridLayout* grid = nullptr;
    QGroupBox* frame = groupBox(u"ערכי התחברות"_s, grid);
    frame->setObjectName(u"fraStep3"_s);
    txtConnServer = textBox(u"txtConnServer"_s);
    txtConnUID = textBox(u"txtConnUID"_s);
    txtConnPWD = textBox(u"txtConnPWD"_s);
    txtConnPWD->setEchoMode(QLineEdit::Password);
    txtConnDatabase = textBox(u"txtConnDatabase"_s);
    cmbDataBase = listBox(u"cmbDataBase"_s, {});
    cmdRefresh = button(u"cmdRefresh"_s, u"סריקה"_s);
    cmdRefresh->setToolTip(u"סרוק רשימת בסיסי נתונים לבחירה"_s);
    const QList<QPair<QString, QLineEdit*>> rows = {{u"שרת נתונים:"_s, txtConnServer},
                                                    {u"משתמש:"_s, txtConnUID},
                                                    {u"סיסמה:"_s, txtConnPWD},
                                                    {u"בסיס נתונים:"_s, txtConnDatabase}};
    for (int i = 0; i < rows.size(); ++i) {
        grid->addWidget(caption(rows[i].first), i, 0);
        grid->addWidget(rows[i].second, i, 1, 1, 2);
        rows[i].second->setLayoutDirection(Qt::LeftToRight);
    }
    grid->addWidget(cmbDataBase, 4, 1);
    grid->addWidget(cmdRefresh, 4, 2);

    CmdCheck = button(u"CmdCheck"_s, u"בדיקה"_s);
    cmdOK = button(u"cmdOK"_s, u"אישור"_s);
    cmdCancel = button(u"cmdCancel"_s, u"ביטול"_s);
    LblMsg = caption(u"מומלץ לבצע בדיקה לאחר שינוי ערכי ההתחברות!"_s, u"LblMsg"_s);
    auto* buttons = new QHBoxLayout;
    buttons->addWidget(CmdCheck);
    buttons->addStretch(1);
    buttons->addWidget(cmdOK);
    buttons->addWidget(cmdCancel);
    auto* layout = new QVBoxLayout(this);
    layout->addWidget(frame);
    layout->addWidget(LblMsg);
    layout->addLayout(buttons);

    connect(cmdRefresh, &QPushButton::clicked, this, &LogonDialog::cmdRefresh_Click);
    connect(cmbDataBase, &QComboBox::activated, this, &LogonDialog::cmbDataBase_Click);
    connect(CmdCheck, &QPushButton::clicked, this, &LogonDialog::CmdCheck_Click);
    connect(cmdOK, &QPushButton::clicked, this, &LogonDialog::cmdOK_Click);
    connect(cmdCancel, &QPushButton::clicked, this, &LogonDialog::cmdCancel_Click);
}

void LogonDialog::cmdRefresh_Click()
{
    FillDBCombo();
}

void LogonDialog::cmbDataBase_Click(int index)
{
    if (index >= 0)
        txtConnDatabase->setText(cmbDataBase->itemText(index));
}

// Picking the first entry does not copy it into the database box: the user's text stays.
void LogonDialog::FillDBCombo()
{
    cmbDataBase->clear();
    try {
        listCompanyDatabases(services_.database, txtConnServer->text(), txtConnUID->text(), txtConnPWD->text(),
                             [this](const QString& name) { cmbDataBase->addItem(name); });
    } catch (const Failure& failure) {
        services_.messages.critical(u"תקלה"_s, failure.description());
        return;
    }
    if (cmbDataBase->count() > 0)
        cmbDataBase->setCurrentIndex(0);
}

void LogonDialog::CmdCheck_Click()
{
    LblMsg->setText(u"בודק התחברות..."_s);
    repaint();
    for (const QString& database : databasesToCheck(txtConnDatabase->text())) {
        try {
            checkCompanyDatabase(services_.database, txtConnServer->text(), txtConnUID->text(), txtConnPWD->text(),
                                 database);
        } catch (const Failure& failure) {
            LblMsg->setText(u"הבדיקה לא הסתיימה בהצלחה"_s);
            services_.messages.critical(u"תקלה"_s, failure.description());
            return;
        }
    }
    LblMsg->setText(u"הבדיקה הסתיימה בהצלחה"_s);
}

void LogonDialog::cmdOK_Click()
{
    state_.ConnServer = txtConnServer->text();
    state_.ConnUID = txtConnUID->text();
    state_.ConnPWD = txtConnPWD->text();
    state_.ConnDataBase = txtConnDatabase->text();
    SetGetRegConnParams(kSave);
    accept();
}

void LogonDialog::cmdCancel_Click()
{
    reject();
}

void LogonDialog::SetGetRegConnParams(unsigned char action)
{
    const QList<QPair<QString, QLineEdit*>> keys = {{u"ConnServer"_s, txtConnServer},
                                                    {u"ConnUID"_s, txtConnUID},
                                                    {u"ConnPWD"_s, txtConnPWD},
                                                    {u"ConnDataBase"_s, txtConnDatabase}};
    for (const auto& [key, box] : keys) {
        try {
            SetGetCtrl(action, services_.settings, kPelmarApp, kParamsSection, key, box, kPropText, {});
        } catch (const Failure&) {
            // A key that cannot be written is skipped; the next one is still saved.
        }
    }
}

void showLogonDialog(Services services, SessionState& state, QWidget* parent)
{
    LogonDialog dialog(services, state, parent);
    dialog.exec();
}

}  // namespace pelmar

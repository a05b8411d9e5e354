#include "control/MainCardControls.h"
#include "control/pages/Pages.h"
#include "options/Lists.h"
#include "widgets/Widgets.h"

#include <QButtonGroup>
#include <QComboBox>
#include <QGridLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPlainTextEdit>
#include <QRadioButton>
#include <QToolButton>
#include <QVBoxLayout>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

QLineEdit* addressBox(const QString& name)
{
    QLineEdit* box = textBox(name);
    box->setLayoutDirection(Qt::LeftToRight);
    return box;
}

QLineEdit* describedBox(const QString& name, const QString& toolTip)
{
    QLineEdit* box = textBox(name);
    box->setToolTip(toolTip);
    return box;
}

QGroupBox* buildMessage(MainCardControls& c)
{
    QGridLayout* grid = nullptr;
    QGroupBox* group = groupBox(u"ההודעה"_s, grid);
    auto* txtEmailFrom = addressBox(u"txtEmailFrom"_s);
    auto* txtEmailFromDesc = describedBox(u"txtEmailFromDesc"_s, u"תאור השולח"_s);
    auto* txtEmailSubject = textBox(u"txtEmailSubject"_s);
    auto* txtEmailContent = new QPlainTextEdit(u"שלום רב. מצורף מידע על המבצעים החדשים"_s);
    txtEmailContent->setObjectName(u"txtEmailContent"_s);
    c.txtEmailHTMLBody = addressBox(u"txtEmailHTMLBody"_s);
    c.CmdDir[1] = folderButton(1, {});
    c.txtEmailAttachFile = addressBox(u"txtEmailAttachFile"_s);
    c.CmdDir[2] = folderButton(2, {});
    auto* txtEmailAttachFileDesc = describedBox(u"txtEmailAttachFileDesc"_s, u"תאור הקובץ"_s);

    grid->addWidget(caption(u"הודעה מאת:"_s), 0, 0);
    grid->addWidget(txtEmailFrom, 0, 1, 1, 2);
    grid->addWidget(txtEmailFromDesc, 0, 3);
    grid->addWidget(caption(u"נושא ההודעה:"_s), 1, 0);
    grid->addWidget(txtEmailSubject, 1, 1, 1, 3);
    grid->addWidget(caption(u"תוכן ההודעה:"_s), 2, 0, Qt::AlignTop);
    grid->addWidget(txtEmailContent, 2, 1, 1, 3);
    grid->addWidget(caption(u"קובץ לגוף ההודעה: (html)"_s), 3, 0);
    grid->addWidget(c.txtEmailHTMLBody, 3, 1);
    grid->addWidget(c.CmdDir[1], 3, 2);
    grid->addWidget(caption(u"קובץ מצורף:"_s), 4, 0);
    grid->addWidget(c.txtEmailAttachFile, 4, 1);
    grid->addWidget(c.CmdDir[2], 4, 2);
    grid->addWidget(txtEmailAttachFileDesc, 4, 3);
    grid->setColumnStretch(1, 2);
    grid->setColumnStretch(3, 1);
    return group;
}

QGroupBox* buildRecipients()
{
    QGridLayout* grid = nullptr;
    QGroupBox* group = groupBox(u"נמענים"_s, grid);
    auto* methods = new QButtonGroup(group);
    QRadioButton* OptEmailMethod[]
        = {nullptr, new QRadioButton(u"דיוור נפרד לכל נמען"_s), new QRadioButton(u"דיוור בקבוצות של "_s)};
    for (int i = 1; i <= 2; ++i) {
        OptEmailMethod[i]->setObjectName(arrayName("OptEmailMethod", i));
        methods->addButton(OptEmailMethod[i], i);
    }
    auto* txtEmailGroupSize = textBox(u"txtEmailGroupSize"_s, u"20"_s);
    txtEmailGroupSize->setMaximumWidth(60);
    auto* txtEmailToMain = addressBox(u"txtEmailToMain"_s);
    auto* txtEmailToMainDesc = describedBox(u"txtEmailToMainDesc"_s, u"תאור הנמען הראשי"_s);
    grid->addWidget(OptEmailMethod[1], 0, 0, 1, 2);
    grid->addWidget(OptEmailMethod[2], 1, 0);
    grid->addWidget(txtEmailGroupSize, 1, 1, Qt::AlignLeading);
    grid->addWidget(caption(u"נמען ראשי:"_s), 2, 0);
    grid->addWidget(txtEmailToMain, 2, 1, 1, 2);
    grid->addWidget(txtEmailToMainDesc, 2, 3);
    grid->setColumnStretch(2, 2);
    grid->setColumnStretch(3, 1);
    return group;
}

// Where the messages go out: the server, its port and security, and the account when the server
// asks for one. The password is masked; it is kept in the settings store, which only its owner
// can read.
QGroupBox* buildServer()
{
    QGridLayout* grid = nullptr;
    QGroupBox* group = groupBox(u"שרת דואר יוצא"_s, grid);
    auto* txtSmtpServer = addressBox(u"txtSmtpServer"_s);
    auto* txtSmtpPort = addressBox(u"txtSmtpPort"_s);
    txtSmtpPort->setMaximumWidth(60);
    auto* txtSmtpUser = addressBox(u"txtSmtpUser"_s);
    auto* txtSmtpPassword = addressBox(u"txtSmtpPassword"_s);
    txtSmtpPassword->setEchoMode(QLineEdit::Password);
    grid->addWidget(caption(u"שרת:"_s), 0, 0);
    grid->addWidget(txtSmtpServer, 0, 1);
    grid->addWidget(caption(u"פורט:"_s), 0, 2);
    grid->addWidget(txtSmtpPort, 0, 3);
    grid->addWidget(caption(u"אבטחה:"_s), 0, 4);
    grid->addWidget(listBox(u"cmbSmtpSecurity"_s, smtpSecurityEntries()), 0, 5);
    grid->addWidget(caption(u"משתמש:"_s), 1, 0);
    grid->addWidget(txtSmtpUser, 1, 1);
    grid->addWidget(caption(u"סיסמה:"_s), 1, 2);
    grid->addWidget(txtSmtpPassword, 1, 3, 1, 3);
    grid->setColumnStretch(1, 2);
    grid->setColumnStretch(5, 1);
    return group;
}

}  // namespace

QWidget* buildEmailPage(MainCardControls& c)
{
    auto* page = new QWidget;
    auto* layout = new QVBoxLayout(page);
    layout->addWidget(buildMessage(c));
    layout->addWidget(buildRecipients());
    layout->addWidget(buildServer());
    layout->addStretch(1);
    return page;
}

}  // namespace pelmar

#include "control/MainCard.h"

#include "common/FileDialogs.h"
#include "common/SessionState.h"
#include "common/UserText.h"
#include "control/OptionsBinder.h"
#include "control/pages/Pages.h"
#include "db/ui/LogonDialog.h"
#include "options/OptionBindings.h"
#include "outputs/ui/LabelStyleDialog.h"
#include "selection/ui/SelectByFileDialog.h"
#include "selection/ui/SelectCardDialog.h"
#include "widgets/ClickableLabel.h"
#include "widgets/Tag.h"

#include <QComboBox>
#include <QCoreApplication>
#include <QEvent>
#include <QFocusEvent>
#include <QFrame>
#include <QLabel>
#include <QLineEdit>
#include <QMessageBox>
#include <QPushButton>
#include <QTabWidget>
#include <QToolButton>
#include <QVBoxLayout>

using namespace Qt::StringLiterals;

namespace pelmar {

MainCard::MainCard(Services services, SessionState& state, QWidget* parent)
    : QWidget(parent), services_(services), state_(state)
{
    setObjectName(u"MainCard"_s);
    buildPages();
    binder_ = std::make_unique<OptionsBinder>(*this, options_);
    showOptions();
    connectHandlers();
}

MainCard::~MainCard() = default;

void MainCard::buildPages()
{
    auto* layout = new QVBoxLayout(this);
    c_.SSTab1 = new QTabWidget;
    c_.SSTab1->setObjectName(u"SSTab1"_s);
    c_.SSTab1->addTab(buildLabelPage(c_), u"הגדרות מדבקת כתובת"_s);
    c_.SSTab1->addTab(buildLettersPage(c_), u"הגדרות למשלוח מכתב"_s);
    c_.SSTab1->addTab(buildEmailPage(c_), u"הגדרות למשלוח דוא\"ל"_s);
    c_.SSTab1->addTab(buildCriteriaPage(c_), u"טווח הכרטיסים"_s);
    c_.SSTab1->addTab(buildGeneralPage(c_), u"הגדרות כלליות"_s);
    layout->addWidget(c_.SSTab1, 1);
    layout->addWidget(buildCommandStrip(c_));
}

void MainCard::connectHandlers()
{
    connect(c_.CmdLabPrev, &QPushButton::clicked, this, &MainCard::CmdLabPrev_Click);
    connect(c_.CmdPreview, &QPushButton::clicked, this, &MainCard::CmdPreview_Click);
    connect(c_.CmdDef, &QPushButton::clicked, this, &MainCard::CmdDef_Click);
    connect(c_.cmdStop, &QPushButton::clicked, this, &MainCard::cmdStop_Click);
    connect(c_.CmdConnect, &QPushButton::clicked, this, &MainCard::CmdConnect_Click);
    connect(c_.CmdLabDef, &QPushButton::clicked, this, &MainCard::CmdLabDef_Click);
    connect(c_.LblDept, &ClickableLabel::clicked, this, &MainCard::LblDept_Click);
    connect(c_.Label56, &ClickableLabel::doubleClicked, this, &MainCard::Label56_DblClick);
    for (int i = 1; i <= 3; ++i)
        connect(c_.CmdDir[i], &QToolButton::clicked, this, [this, i] { CmdDir_Click(i); });
    c_.cmbCS->installEventFilter(this);
    connect(c_.cmbCS, &QComboBox::activated, this, &MainCard::cmbCS_Validate);
    connect(c_.cmdSelectAccount, &QPushButton::clicked, this, &MainCard::cmdSelectAccount_Click);
    connect(c_.CmdSelectGroup, &QPushButton::clicked, this, &MainCard::CmdSelectGroup_Click);
    connect(c_.cmdQryGroup, &QPushButton::clicked, this, &MainCard::cmdQryGroup_Click);
    connect(c_.cmdSelByFile, &QPushButton::clicked, this, &MainCard::cmdSelByFile_Click);
}

// The sales employee list takes its entries from the options before the options are shown.
void MainCard::showOptions()
{
    {
        const QSignalBlocker quiet(c_.CmbAgent);
        c_.CmbAgent->clear();
        for (const SalesEmployee& employee : options_.agents)
            c_.CmbAgent->addItem(isolated(employee.name), employee.code);
    }
    binder_->show();
}

bool MainCard::eventFilter(QObject* watched, QEvent* event)
{
    // The card type's groups belong to one type: moving on from the list to another control
    // forgets the chosen groups. Opening its popup or switching to another window is not moving on.
    if (watched == c_.cmbCS && event->type() == QEvent::FocusOut) {
        const Qt::FocusReason reason = static_cast<QFocusEvent*>(event)->reason();
        if (reason != Qt::PopupFocusReason && reason != Qt::ActiveWindowFocusReason)
            cmbCS_Validate();
    }
    return QWidget::eventFilter(watched, event);
}

void MainCard::cmbCS_Validate()
{
    state_.clearCardGroups();
}

bool MainCard::mayClose()
{
    MailingOptions stored = options_;
    SetGetRegParams(2, services_.settings, stored);
    if (stored == options_)
        return true;
    QMessageBox box(QMessageBox::Question, window()->windowTitle(), u"ההגדרות שבדפים שונו ולא נשמרו. לשמור אותן?"_s,
                    QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel, this);
    box.setLayoutDirection(Qt::RightToLeft);
    switch (box.exec()) {
    case QMessageBox::Yes: CmdDef_Click(); return true;
    case QMessageBox::No: return true;
    default: return false;
    }
}

void MainCard::CmdDef_Click()
{
    SetGetRegParams(1, services_.settings, options_);
}

void MainCard::CmdConnect_Click()
{
    showLogonDialog(services_, state_, this);
    UserControl_Initialize();
}

void MainCard::CmdLabDef_Click()
{
    LabelStyleDialog dialog(services_.settings, services_.messages, state_.LabelDefs, this);
    dialog.exec();
}

void MainCard::cmdStop_Click()
{
    state_.StopRequested = true;
    QCoreApplication::processEvents();
}

void MainCard::LblDept_Click()
{
    if (options_.deptTag.isEmpty() || options_.deptTag == u"0"_s)
        options_.deptTag = u"1"_s;
    else if (options_.deptTag == u"1"_s)
        options_.deptTag = u"0"_s;
    setTag(c_.LblDept, options_.deptTag);
    showDeptCaption();
}

void MainCard::showDeptCaption()
{
    if (options_.deptTag.isEmpty() || options_.deptTag == u"0"_s)
        c_.LblDept->setText(u"מחלקה"_s);
    else if (options_.deptTag == u"1"_s)
        c_.LblDept->setText(u"תפקיד"_s);
}

QString MainCard::PickOpenFile(int index)
{
    static const QString filters[] = {
        {},
        u"All Files (*.*)|*.*|HTML Files (*.htm,*.html)|*.htm;*.html"_s,
        u"All Files (*.*)|*.*"_s,
        u"All Files (*.*)|*.*|Word Files (*.doc)|*.doc"_s,
    };
    return services_.files.openFile(filters[index], 2);
}

void MainCard::CmdDir_Click(int index)
{
    QLineEdit* targets[] = {nullptr, c_.txtEmailHTMLBody, c_.txtEmailAttachFile, c_.txtFaxFile};
    if (index < 1 || index > 3)
        return;
    const QString path = PickOpenFile(index);
    if (!path.isEmpty())
        targets[index]->setText(path);
}

void MainCard::report(const QString& text, double fraction)
{
    c_.Message1->setText(text);
    const int full = c_.ProgressFrame->width();
    const int width = qRound(fraction * full);
    const int x = layoutDirection() == Qt::RightToLeft ? full - width : 0;
    c_.ProgressFill->setGeometry(x, 0, width, c_.ProgressFrame->height());
}

}  // namespace pelmar

#include "app/Cli.h"

#include "app/CliSeams.h"
#include "app/CommandLine.h"
#include "common/Failure.h"
#include "common/SessionState.h"
#include "common/TempFolder.h"
#include "common/UserText.h"
#include "control/ClickableLabel.h"
#include "control/MainCard.h"
#include "control/QtSeams.h"
#include "control/SetGetCtrl.h"
#include "db/Connection.h"
#include "db/DatabaseClient.h"
#include "db/OdbcDrivers.h"
#include "demo/DemoCompany.h"
#include "selection/SelectBuilder.h"
#include "selection/SelectedCards.h"
#include "settings/SettingsStore.h"

#include <QCheckBox>
#include <QComboBox>
#include <QCoreApplication>
#include <QFile>
#include <QLineEdit>
#include <QPlainTextEdit>
#include <QRadioButton>
#include <QTextStream>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

QTextStream& out()
{
    static QTextStream stream(stdout);
    return stream;
}

QTextStream& err()
{
    static QTextStream stream(stderr);
    return stream;
}

unsigned char propertyOf(const QWidget* control)
{
    if (qobject_cast<const QLineEdit*>(control) || qobject_cast<const QPlainTextEdit*>(control))
        return kPropText;
    if (qobject_cast<const QComboBox*>(control))
        return kPropListIndex;
    if (qobject_cast<const QCheckBox*>(control) || qobject_cast<const QRadioButton*>(control))
        return kPropValue;
    if (qobject_cast<const ClickableLabel*>(control))
        return kPropTag;
    return 0;
}

void setControl(MainCard& card, const QString& name, const QString& value)
{
    auto* control = card.findChild<QWidget*>(name);
    const unsigned char prop = control ? propertyOf(control) : 0;
    if (!prop)
        throw UsageError(u"--set: there is no control \"%1\" to set"_s.arg(name));
    try {
        assignProperty(control, prop, value);
    } catch (const Failure&) {
        throw UsageError(u"--set: %1 cannot take \"%2\""_s.arg(name, value));
    }
}

QStringList cardsFromFile(const QString& path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        throw UsageError(u"--cards: cannot read %1: %2"_s.arg(path, file.errorString()));
    QStringList codes;
    for (const QString& line : decodeUserText(file.readAll()).split(u'\n')) {
        const QString code = QString(line).remove(u'\r');
        if (!code.isEmpty())
            codes << code;
    }
    return codes;
}

void applyOptions(const CommandLine& line, MainCard& card, SessionState& state)
{
    for (const auto& [name, value] : line.sets)
        setControl(card, name, value);
    const MainCardControls& c = card.controls();
    QStringList cards = line.cards;
    if (!line.cardsFile.isEmpty())
        cards += cardsFromFile(line.cardsFile);
    if (!cards.isEmpty()) {
        replaceSelectedCards(state, cards);
        c.ChkSelectAccount->setChecked(true);
    }
    if (line.groups) {
        state.clearCardGroups();
        for (const int code : *line.groups)
            state.SelCardGroups.append({static_cast<short>(code), true});
        c.ChkCatCode->setChecked(true);
    }
    if (line.properties) {
        state.QryGroupSel.fill(false);
        for (const int n : *line.properties)
            state.QryGroupSel[n] = true;
        c.chkQryGroup->setChecked(true);
    }
    if (!line.relation.isEmpty())
        state.QryGroupRelation = line.relation;
}

QString outputOr(const CommandLine& line, const QString& name)
{
    return line.output.isEmpty() ? tempFile(name) : line.output;
}

// Runs the command on the control; false when it wrote nothing.
bool runOn(const CommandLine& line, MainCard& card, BrowserWindow& browser)
{
    const short chosenKind = static_cast<short>(std::max(0, card.controls().cmbOutType->currentIndex()) + 2);
    if (line.command == u"labels"_s || line.command == u"list"_s || line.command == u"card"_s) {
        QString path;
        bool written = false;
        if (line.command == u"labels"_s) {
            path = outputOr(line, u"pelmar1.htm"_s);
            written = card.CreateLabFile(path);
        } else if (line.command == u"list"_s) {
            path = outputOr(line, u"pelmar2.htm"_s);
            written = card.CreateHTML(path, static_cast<short>(line.kind.value_or(chosenKind)));
        } else {
            path = outputOr(line, u"pelmar3.htm"_s);
            written = card.CreateCardFile(path, line.cardCode.trimmed());
        }
        if (written) {
            browser.open(path);
            out() << path << Qt::endl;
        }
        return written;
    }
    if (line.command == u"sms"_s) {
        card.SaveSMSList();
        return true;
    }
    if (card.state().SboVersionLevel == -1)
        return false;
    const short kind = static_cast<short>(line.kind.value_or(chosenKind));
    out() << card.recipientStatement(kind, line.allDetails, !line.noOrder) << Qt::endl;
    return true;
}

int runDemo(const CommandLine& line)
{
    SettingsStore store = SettingsStore::forCurrentUser();
    const auto result = createDemoCompany(store, embeddedCompaniesFolder(), line.force);
    out() << result.message << Qt::endl;
    return 0;
}

int runControl(const CommandLine& line)
{
    SettingsStore store = SettingsStore::forCurrentUser();
    const DatabaseClient database(chooseSqlServerDriver(configuredSqlServerDriver(store), installedOdbcDrivers()));
    CliMessages messages(line.yes);
    DesktopBrowser desktop;
    CliBrowser browser(desktop, line.open);
    CliFileDialogs files(line.output);
    SessionState state;
    MainCard card(Services{messages, browser, files, store, database}, state);
    card.UserControl_Initialize();
    applyOptions(line, card, state);
    if (line.command == u"sql"_s)
        state.SboVersionLevel = GetSboVersionLevel(database, companyConnString(state), messages);
    if (line.save)
        card.SetGetRegParams(kSave);
    try {
        if (!runOn(line, card, browser))
            return 1;
    } catch (const Failure& failure) {
        messages.critical(u"תקלה"_s, failure.description());
    }
    return messages.failed() ? 1 : 0;
}

}  // namespace

int runCommandLine(const QStringList& arguments)
{
    try {
        const CommandLine line = CommandLine::parse(arguments);
        if (line.help) {
            out() << usageText();
            return 0;
        }
        if (line.version) {
            out() << u"pelmar "_s << QCoreApplication::applicationVersion() << Qt::endl;
            return 0;
        }
        return line.command == u"demo"_s ? runDemo(line) : runControl(line);
    } catch (const UsageError& usage) {
        err() << u"pelmar: "_s << usage.message() << Qt::endl << u"Run \"pelmar --help\" for the commands."_s << Qt::endl;
        return 2;
    } catch (const Failure& failure) {
        err() << u"תקלה: "_s << failure.description() << Qt::endl;
        return 1;
    }
}

}  // namespace pelmar

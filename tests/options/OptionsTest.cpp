#include "common/Failure.h"
#include "options/Lists.h"
#include "options/OptionBindings.h"
#include "settings/SettingsStore.h"
#include "support/Isolated.h"

#include <sys/stat.h>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

class Options : public Isolated {
protected:
    QString key(const QString& name) const { return store.value(u"Pelmar"_s, u"Params"_s, name, u"<none>"_s); }
    void setKey(const QString& name, const QString& value) { store.setValue(u"Pelmar"_s, u"Params"_s, name, value); }

    SettingsStore store{configFolder()};
};

// Options whose every field differs from a fresh one; the sales employee list has three entries.
MailingOptions changedEverything()
{
    MailingOptions options;
    options.agents = {{u"א"_s, 1}, {u"ב"_s, 2}, {u"ג"_s, 3}};
    for (const OptionBinding& binding : optionBindings()) {
        switch (binding.kind) {
        case OptionKind::Text:
        case OptionKind::Tag: binding.text(options) = u"ערך '%1'"_s.arg(binding.control); break;
        case OptionKind::ListIndex: binding.number(options) = binding.entries(options) - 1; break;
        case OptionKind::Check: binding.flag(options) = !binding.flag(options); break;
        case OptionKind::Choice: binding.number(options) = 2; break;
        }
    }
    return options;
}

TEST_F(Options, SavingThenLoadingGivesBackEveryStoredOption)
{
    const MailingOptions changed = changedEverything();
    MailingOptions saved = changed;
    SetGetRegParams(1, store, saved);

    MailingOptions loaded;
    loaded.agents = changed.agents;
    SetGetRegParams(2, store, loaded);
    for (const OptionBinding& binding : optionBindings()) {
        const QString expected = optionText(binding, binding.key.isEmpty() ? MailingOptions{} : changed);
        EXPECT_EQ(optionText(binding, loaded), expected) << binding.control.toStdString();
    }
}

TEST_F(Options, AnEmptyStoreGivesTheDefaults)
{
    MailingOptions options;
    options.cols = u"7"_s;
    options.faxTransport = 2;
    SetGetRegParams(2, store, options);
    EXPECT_EQ(options, MailingOptions{}) << "every field back at its default";
    EXPECT_EQ(options.rows, u"8"_s);
    EXPECT_EQ(options.copies, u"1"_s);
    EXPECT_TRUE(options.showAttn);
    EXPECT_EQ(options.addressFrom, 2);
    EXPECT_EQ(options.faxDelay, u"5"_s);
    EXPECT_EQ(options.localAreaPrefix, u"04"_s);
    EXPECT_EQ(options.emailGroupSize, u"20"_s);
    EXPECT_EQ(options.faxTransport, 1) << "WinFax";
    EXPECT_EQ(options.emailMethod, 1) << "a message per recipient";
    EXPECT_EQ(options.fromDate, u"01/01/1980"_s);
    EXPECT_EQ(options.toDate, u"01/01/2025"_s);
    EXPECT_EQ(options.faxSubject, u"מבצע השבוע"_s);
    EXPECT_EQ(options.agentIndex, -1) << "the stored first entry does not exist while the list is empty";
}

TEST_F(Options, SavingWritesEveryKeyWithItsValueText)
{
    MailingOptions options;
    SetGetRegParams(2, store, options);
    SetGetRegParams(1, store, options);
    EXPECT_EQ(key(u"OutType"_s), u"0"_s);
    EXPECT_EQ(key(u"ShowAttn"_s), u"1"_s);
    EXPECT_EQ(key(u"UseTitle12"_s), u"0"_s);
    EXPECT_EQ(key(u"OptOLE1"_s), u"True"_s);
    EXPECT_EQ(key(u"OptOLE2"_s), u"False"_s);
    EXPECT_EQ(key(u"DeptField"_s), u"0"_s);
    EXPECT_EQ(key(u"Agent"_s), u"-1"_s);
    EXPECT_EQ(key(u"FaxExpr4"_s), u""_s);
    EXPECT_EQ(key(u"FaxExpr3"_s), u"<none>"_s) << "a fixed merge row has no expression key";
    EXPECT_EQ(key(u"UseFaxField7"_s), u"0"_s);
    EXPECT_EQ(key(u"EmailSubject"_s), u"מבצעי השבוע"_s);
    EXPECT_EQ(key(u"ConnPWD"_s), u"<none>"_s) << "connection keys belong to the logon dialog";
    EXPECT_EQ(key(u"StartFrom"_s), u"<none>"_s) << "the start position is not kept";

    struct stat info {};
    ASSERT_EQ(::stat(store.filePath(u"Pelmar"_s).toLocal8Bit().constData(), &info), 0);
    EXPECT_EQ(info.st_mode & 0777, 0600u);
}

TEST_F(Options, AnActionOtherThanSaveOrLoadTouchesNothing)
{
    MailingOptions options = changedEverything();
    const MailingOptions before = options;
    setKey(u"Rows"_s, u"4"_s);
    SetGetRegParams(3, store, options);
    SetGetRegParams(0, store, options);
    EXPECT_EQ(options, before);
    EXPECT_FALSE(store.contains(u"Pelmar"_s, u"Params"_s, u"Cols"_s));
}

TEST_F(Options, AValueTheControlCannotTakeLeavesTheOptionAndLoadingGoesOn)
{
    MailingOptions options;
    options.outType = 3;
    options.catCode = true;
    setKey(u"OutType"_s, u"5"_s);
    setKey(u"UseCatCode"_s, u"yes"_s);
    setKey(u"CS"_s, u"2"_s);
    SetGetRegParams(2, store, options);
    EXPECT_EQ(options.outType, 3) << "position 5 is one past the last entry";
    EXPECT_TRUE(options.catCode);
    EXPECT_EQ(options.cardType, 2);

    setKey(u"OutType"_s, u"4"_s);
    setKey(u"Agent"_s, u"1"_s);
    options.agents = {{u"א"_s, 1}, {u"ב"_s, 2}};
    SetGetRegParams(2, store, options);
    EXPECT_EQ(options.outType, 4) << "the last entry";
    EXPECT_EQ(options.agentIndex, 1) << "the sales employee list takes its own length";
}

TEST_F(Options, OptionButtonsOfAGroupTurnEachOtherOff)
{
    MailingOptions options;
    setKey(u"OptOLE1"_s, u"False"_s);
    setKey(u"OptOLE2"_s, u"True"_s);
    SetGetRegParams(2, store, options);
    EXPECT_EQ(options.faxTransport, 2);

    setKey(u"OptOLE1"_s, u"true"_s);
    setKey(u"OptOLE2"_s, u"False"_s);
    SetGetRegParams(2, store, options);
    EXPECT_EQ(options.faxTransport, 1) << "turning the fax service off leaves WinFax on";

    setKey(u"OptOLE1"_s, u"False"_s);
    SetGetRegParams(2, store, options);
    EXPECT_EQ(options.faxTransport, 0) << "both stored false leave no transport chosen";

    setKey(u"OptOLE1"_s, u"-1"_s);
    setKey(u"OptOLE2"_s, u"0"_s);
    SetGetRegParams(2, store, options);
    EXPECT_EQ(options.faxTransport, 1) << "a number is a truth value, nonzero true";
}

TEST_F(Options, OnlyTheFreeMergeRowsKeepAnExpression)
{
    QStringList expressionKeys;
    for (const OptionBinding& binding : optionBindings()) {
        if (binding.key.startsWith(u"FaxExpr"_s))
            expressionKeys << binding.key;
    }
    EXPECT_EQ(expressionKeys, (QStringList{u"FaxExpr4"_s, u"FaxExpr5"_s, u"FaxExpr6"_s, u"FaxExpr7"_s}));
}

TEST_F(Options, EachKindOfOptionTakesItsTextOrRefusesItByName)
{
    MailingOptions options;
    const auto set = [&](const char16_t* control, const QString& text) {
        setOptionText(*optionNamed(QString::fromUtf16(control)), options, text);
    };
    set(u"txtRows", u" 12 "_s);
    EXPECT_EQ(options.rows, u" 12 "_s) << "a text box keeps the text as typed";
    set(u"CmbSortBy", u" 5 "_s);
    EXPECT_EQ(options.sortBy, 5);
    set(u"CmbSortBy", u"-1"_s);
    EXPECT_EQ(options.sortBy, -1) << "nothing chosen";
    set(u"ChkTitle_12", u"1"_s);
    EXPECT_TRUE(options.useTitle[12]);
    set(u"LblDept", u"1"_s);
    EXPECT_EQ(options.deptTag, u"1"_s);

    const std::pair<const char16_t*, QString> refused[]
        = {{u"CmbSortBy", u"6"_s},  {u"CmbSortBy", u"-2"_s},    {u"CmbSortBy", u"x"_s},
           {u"ChkTitle_0", u"2"_s}, {u"ChkTitle_0", u"true"_s}, {u"OptOLE_2", u"maybe"_s}};
    for (const auto& [control, text] : refused) {
        const MailingOptions before = options;
        try {
            set(control, text);
            ADD_FAILURE() << text.toStdString();
        } catch (const Failure& failure) {
            EXPECT_EQ(failure.description(),
                      u"Invalid property value \"%1\" for %2."_s.arg(text, QString::fromUtf16(control)));
        }
        EXPECT_EQ(options, before) << "a refused text changes nothing";
    }
    EXPECT_EQ(optionNamed(u"chkfaxfield_1"_s), nullptr) << "names are matched exactly";
    EXPECT_EQ(optionNamed(u"Label56"_s), nullptr);
}

}  // namespace
}  // namespace pelmar::test

#include "options/OptionBindings.h"

#include "common/Failure.h"
#include "options/Lists.h"
#include "settings/SettingsStore.h"

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

using TextField = QString MailingOptions::*;
using NumberField = int MailingOptions::*;
using FlagField = bool MailingOptions::*;

QString arrayControl(const char16_t* name, int index)
{
    return QString::fromUtf16(name) + u'_' + QString::number(index);
}

OptionBinding textOption(const QString& control, const QString& key, std::function<QString&(MailingOptions&)> field,
                         OptionKind kind = OptionKind::Text)
{
    OptionBinding binding{control, key, kind, std::move(field), {}, {}, 0, {}, {}};
    MailingOptions fresh;
    binding.fallback = binding.text(fresh);
    return binding;
}

OptionBinding textOption(const char16_t* control, const char16_t* key, TextField field)
{
    return textOption(QString::fromUtf16(control), QString::fromUtf16(key),
                      [field](MailingOptions& o) -> QString& { return o.*field; });
}

OptionBinding flagOption(const QString& control, const QString& key, std::function<bool&(MailingOptions&)> field)
{
    OptionBinding binding{control, key, OptionKind::Check, {}, {}, std::move(field), 0, {}, {}};
    MailingOptions fresh;
    binding.fallback = binding.flag(fresh) ? u"1"_s : u"0"_s;
    return binding;
}

OptionBinding flagOption(const char16_t* control, const char16_t* key, FlagField field)
{
    return flagOption(QString::fromUtf16(control), QString::fromUtf16(key),
                      [field](MailingOptions& o) -> bool& { return o.*field; });
}

OptionBinding listOption(const char16_t* control, const char16_t* key, NumberField field,
                         const QStringList& (*entries)())
{
    OptionBinding binding{QString::fromUtf16(control),
                          QString::fromUtf16(key),
                          OptionKind::ListIndex,
                          {},
                          [field](MailingOptions& o) -> int& { return o.*field; },
                          {},
                          0,
                          [entries](const MailingOptions&) { return static_cast<int>(entries().size()); },
                          {}};
    binding.fallback = QString::number(MailingOptions{}.*field);
    return binding;
}

// The sales employee list is empty until the employees are read, so a fresh page has nothing
// chosen there; the key's own default is the first entry.
OptionBinding agentOption()
{
    return {u"CmbAgent"_s,
            u"Agent"_s,
            OptionKind::ListIndex,
            {},
            [](MailingOptions& o) -> int& { return o.agentIndex; },
            {},
            0,
            [](const MailingOptions& o) { return static_cast<int>(o.agents.size()); },
            u"0"_s};
}

OptionBinding choiceOption(const QString& control, const QString& key, NumberField group, int choice)
{
    OptionBinding binding{
        control, key, OptionKind::Choice, {}, [group](MailingOptions& o) -> int& { return o.*group; }, {}, choice,
        {},      {}};
    binding.fallback = MailingOptions{}.*group == choice ? u"True"_s : u"False"_s;
    return binding;
}

void addStoredOptions(QList<OptionBinding>& all)
{
    all << listOption(u"cmbOutType", u"OutType", &MailingOptions::outType, &outputTypeEntries)
        << flagOption(u"ChkCatCode", u"UseCatCode", &MailingOptions::catCode)
        << listOption(u"cmbCS", u"CS", &MailingOptions::cardType, &cardTypeEntries)
        << flagOption(u"ChkAccKey", u"UseAccKey", &MailingOptions::codeRange)
        << textOption(u"TxtFromCrd", u"FromCrd", &MailingOptions::fromCard)
        << textOption(u"TxtToCrd", u"ToCrd", &MailingOptions::toCard)
        << flagOption(u"ChkCity", u"UseCity", &MailingOptions::city)
        << textOption(u"TxtCity", u"City", &MailingOptions::cityPrefix)
        << flagOption(u"ChkPhone", u"UsePhone", &MailingOptions::phone)
        << textOption(u"txtPhone", u"Phone", &MailingOptions::phonePrefix)
        << flagOption(u"ChkAgent", u"UseAgent", &MailingOptions::agent) << agentOption()
        << flagOption(u"ChkDates", u"UseDates", &MailingOptions::dates)
        << textOption(u"TxtFromDate", u"FromDate", &MailingOptions::fromDate)
        << textOption(u"TxtToDate", u"ToDate", &MailingOptions::toDate)
        << listOption(u"CmbDocType", u"DocType", &MailingOptions::docType, &documentTypeEntries)
        << flagOption(u"ChkUseSQLW", u"UseSQLW", &MailingOptions::sqlWhere)
        << textOption(u"txtSQLWhere", u"SQLWhere", &MailingOptions::sqlWhereText)
        << flagOption(u"ChkAddressBySQL", u"AddressBySQL", &MailingOptions::addressBySql)
        << textOption(u"txtSQLAddress", u"SQLAddress", &MailingOptions::sqlAddress)
        << textOption(u"txtRows", u"Rows", &MailingOptions::rows)
        << textOption(u"txtCols", u"Cols", &MailingOptions::cols)
        << textOption(u"txtCopies", u"Copies", &MailingOptions::copies)
        << listOption(u"CmbSortBy", u"SortBy", &MailingOptions::sortBy, &sortByEntries)
        << listOption(u"CmbSortDir", u"SortDir", &MailingOptions::sortDir, &sortDirectionEntries)
        << listOption(u"cmbByDoc", u"ByDoc", &MailingOptions::byDoc, &byDocumentEntries)
        << textOption(
               u"LblDept"_s, u"DeptField"_s, [](MailingOptions& o) -> QString& { return o.deptTag; }, OptionKind::Tag)
        << flagOption(u"chkShowAttn", u"ShowAttn", &MailingOptions::showAttn);
    for (int i = 0; i < 13; ++i)
        all << flagOption(arrayControl(u"ChkTitle", i), u"UseTitle"_s + QString::number(i),
                          [i](MailingOptions& o) -> bool& { return o.useTitle[i]; });
    all << flagOption(u"chkDeptNewLine", u"DeptNewLine", &MailingOptions::deptNewLine)
        << flagOption(u"ChkAllContact", u"AllContact", &MailingOptions::allContacts)
        << flagOption(u"chkUseCntctAddrss", u"UseCntctAddrss", &MailingOptions::useContactAddress)
        << listOption(u"cmbAddressFrom", u"AddressFrom", &MailingOptions::addressFrom, &addressSourceEntries)
        << listOption(u"cmbPhoneType", u"PhoneType", &MailingOptions::phoneType, &phoneTypeEntries)
        << listOption(u"cmbLabFormat", u"LabFormat", &MailingOptions::labFormat, &labelTemplateEntries)
        << textOption(u"txtFaxSubject", u"FaxSubject", &MailingOptions::faxSubject)
        << textOption(u"txtFaxDelay", u"FaxDelay", &MailingOptions::faxDelay)
        << textOption(u"TxtLocalAreaPrefix", u"LocalAreaPrefix", &MailingOptions::localAreaPrefix)
        << choiceOption(u"OptOLE_1"_s, u"OptOLE1"_s, &MailingOptions::faxTransport, 1)
        << choiceOption(u"OptOLE_2"_s, u"OptOLE2"_s, &MailingOptions::faxTransport, 2)
        << textOption(u"txtFaxFile", u"FaxFile", &MailingOptions::faxFile);
    for (int i = 0; i < 8; ++i) {
        all << flagOption(arrayControl(u"chkFaxField", i), u"UseFaxField"_s + QString::number(i),
                          [i](MailingOptions& o) -> bool& { return o.faxField[i]; });
        if (mergeRows().at(i).free)
            all << textOption(arrayControl(u"txtFaxExpr", i), u"FaxExpr"_s + QString::number(i),
                              [i](MailingOptions& o) -> QString& { return o.faxExpr[i]; });
    }
    all << textOption(u"txtEmailAttachFile", u"EmailAttachFile", &MailingOptions::emailAttachFile)
        << textOption(u"txtEmailAttachFileDesc", u"EmailAttachFileDesc", &MailingOptions::emailAttachFileDesc)
        << textOption(u"txtEmailFrom", u"EmailFrom", &MailingOptions::emailFrom)
        << textOption(u"txtEmailFromDesc", u"EmailFromDesc", &MailingOptions::emailFromDesc)
        << textOption(u"txtEmailGroupSize", u"EmailGroupSize", &MailingOptions::emailGroupSize)
        << textOption(u"txtEmailHTMLBody", u"EmailHTMLBody", &MailingOptions::emailHtmlBody)
        << textOption(u"txtEmailSubject", u"EmailSubject", &MailingOptions::emailSubject)
        << textOption(u"txtEmailToMain", u"EmailToMain", &MailingOptions::emailToMain)
        << textOption(u"txtEmailToMainDesc", u"EmailToMainDesc", &MailingOptions::emailToMainDesc)
        << choiceOption(u"OptEmailMethod_1"_s, u"OptEmailMethod1"_s, &MailingOptions::emailMethod, 1)
        << choiceOption(u"OptEmailMethod_2"_s, u"OptEmailMethod2"_s, &MailingOptions::emailMethod, 2)
        << textOption(u"txtSmtpServer", u"SmtpServer", &MailingOptions::smtpServer)
        << textOption(u"txtSmtpPort", u"SmtpPort", &MailingOptions::smtpPort)
        << listOption(u"cmbSmtpSecurity", u"SmtpSecurity", &MailingOptions::smtpSecurity, &smtpSecurityEntries)
        << textOption(u"txtSmtpUser", u"SmtpUser", &MailingOptions::smtpUser)
        << textOption(u"txtSmtpPassword", u"SmtpPassword", &MailingOptions::smtpPassword);
}

void addPageOptions(QList<OptionBinding>& all)
{
    all << textOption(u"txtStartFrom", {}, &MailingOptions::startFrom)
        << textOption(u"txtFromDocNum", {}, &MailingOptions::fromDocNum)
        << textOption(u"txtToDocNum", {}, &MailingOptions::toDocNum)
        << flagOption(u"ChkItems", {}, &MailingOptions::items)
        << textOption(u"txtFromItem", {}, &MailingOptions::fromItem)
        << textOption(u"txtToItem", {}, &MailingOptions::toItem)
        << flagOption(u"chkQryGroup", {}, &MailingOptions::properties)
        << flagOption(u"ChkSelectAccount", {}, &MailingOptions::selectAccount)
        << textOption(u"txtEmailContent", {}, &MailingOptions::emailContent);
}

[[noreturn]] void refuse(const OptionBinding& binding, const QString& text)
{
    throw Failure(u"Invalid property value \"%1\" for %2."_s.arg(text, binding.control), 380);
}

// An option button's value: a truth value's text, or a number (nonzero is true).
bool truthOf(const OptionBinding& binding, const QString& text)
{
    if (text.compare(u"True"_s, Qt::CaseInsensitive) == 0)
        return true;
    if (text.compare(u"False"_s, Qt::CaseInsensitive) == 0)
        return false;
    bool numeric = false;
    const int number = text.trimmed().toInt(&numeric);
    if (!numeric)
        refuse(binding, text);
    return number != 0;
}

}  // namespace

const QList<OptionBinding>& optionBindings()
{
    static const QList<OptionBinding> all = [] {
        QList<OptionBinding> bindings;
        addStoredOptions(bindings);
        addPageOptions(bindings);
        return bindings;
    }();
    return all;
}

const OptionBinding* optionNamed(const QString& control)
{
    for (const OptionBinding& binding : optionBindings()) {
        if (binding.control == control)
            return &binding;
    }
    return nullptr;
}

QString optionText(const OptionBinding& binding, const MailingOptions& options)
{
    // The accessors hand out references for both reading and writing; this one only reads.
    auto& o = const_cast<MailingOptions&>(options);
    switch (binding.kind) {
    case OptionKind::Text:
    case OptionKind::Tag: return binding.text(o);
    case OptionKind::ListIndex: return QString::number(binding.number(o));
    case OptionKind::Check: return binding.flag(o) ? u"1"_s : u"0"_s;
    case OptionKind::Choice: return binding.number(o) == binding.choice ? u"True"_s : u"False"_s;
    }
    return {};
}

void setOptionText(const OptionBinding& binding, MailingOptions& options, const QString& text)
{
    switch (binding.kind) {
    case OptionKind::Text:
    case OptionKind::Tag: binding.text(options) = text; return;
    case OptionKind::ListIndex: {
        bool numeric = false;
        const int index = text.trimmed().toInt(&numeric);
        if (!numeric || index < -1 || index >= binding.entries(options))
            refuse(binding, text);
        binding.number(options) = index;
        return;
    }
    case OptionKind::Check: {
        const QString value = text.trimmed();
        if (value != u"0"_s && value != u"1"_s)
            refuse(binding, text);
        binding.flag(options) = value == u"1"_s;
        return;
    }
    case OptionKind::Choice: {
        int& group = binding.number(options);
        if (truthOf(binding, text))
            group = binding.choice;
        else if (group == binding.choice)
            group = 0;
        return;
    }
    }
}

void SetGetRegParams(unsigned char action, SettingsStore& store, MailingOptions& options)
{
    if (action != 1 && action != 2)
        return;
    for (const OptionBinding& binding : optionBindings()) {
        if (binding.key.isEmpty())
            continue;
        try {
            if (action == 1)
                store.setValue(kPelmarApp, kParamsSection, binding.key, optionText(binding, options));
            else
                setOptionText(binding, options, store.value(kPelmarApp, kParamsSection, binding.key, binding.fallback));
        } catch (const Failure&) {
            // A key that cannot be written, read or assigned is skipped; the next one follows.
        }
    }
}

}  // namespace pelmar

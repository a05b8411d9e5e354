#include "outputs/LabelComposer.h"

#include "common/TextFileWriter.h"
#include "db/Recordset.h"
#include "options/MailingOptions.h"

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

constexpr std::array<int, 13> kStandardOrder = {0, 11, 1, 12, 2, 3, 6, 4, 7, 5, 8, 9, 10};
constexpr std::array<int, 13> kContactFirstOrder = {0, 11, 3, 12, 1, 2, 6, 4, 7, 5, 8, 9, 10};
constexpr int kDepartmentLine = 6;
constexpr qsizetype kLineWidth = 30;

const char16_t* const kColumnNames[]
    = {u"CardCode",   u"CardName",   u"MailAddres", u"MailCity",   u"MailZipCod", u"Attn",
       u"Department", u"CntctAddrs", u"MailBlock",  u"MailCounty", u"MailState",  u"MailCountry"};

// Blanks (spaces) off both ends, as the database values are trimmed.
QStringView trimmed(QStringView text)
{
    while (!text.isEmpty() && text.front() == u' ')
        text = text.mid(1);
    while (!text.isEmpty() && text.back() == u' ')
        text.chop(1);
    return text;
}

// One line of a label: up to four pieces of markup and values.
struct LabelLine {
    struct Piece {
        QStringView text;
        Html mode;
    };
    std::array<Piece, 4> pieces{};
    int count = 0;

    void add(QStringView text, Html mode) { pieces[count++] = {text, mode}; }
    bool empty() const
    {
        for (int i = 0; i < count; ++i) {
            if (!pieces[i].text.isEmpty())
                return false;
        }
        return true;
    }
};

}  // namespace

bool IsHebrew(QStringView text)
{
    return std::any_of(text.begin(), text.end(),
                       [](QChar c) { return c.unicode() >= 0x05D0 && c.unicode() <= 0x05EA; });
}

LabelComposer::LabelComposer(const MailingOptions& options, const LabelDefTable& styles, const Recordset& rows)
    : options_(options), rows_(rows), fixedAbove_(styles[11].FixedText.left(kLineWidth)),
      fixedBelow_(styles[12].FixedText.left(kLineWidth))
{
    for (int column = 0; column < ColumnCount; ++column)
        columns_[column] = rows.columnIndex(QString::fromUtf16(kColumnNames[column]));
    for (int line = 0; line < 13; ++line) {
        hebrewPrefix_[line] = "    <tr class=L" + QByteArray::number(line) + "><td>";
        otherPrefix_[line] = "    <tr class=LE" + QByteArray::number(line) + "><td>";
    }
}

QString LabelComposer::text(Column column) const
{
    const int index = columns_[column];
    if (index < 0)
        return {};
    const QVariant& value = rows_.valueAt(index);
    return value.isNull() ? QString() : value.toString();
}

void LabelComposer::write(TextFileWriter& file) const
{
    std::array<QString, ColumnCount> v;
    for (int column = 0; column < ColumnCount; ++column)
        v[column] = text(static_cast<Column>(column));

    const int directionColumn
        = columns_[MailAddres] >= 0 && !rows_.valueAt(columns_[MailAddres]).isNull() ? MailAddres : MailCity;
    const bool hebrew = IsHebrew(v[directionColumn]);

    std::array<LabelLine, 13> lines;
    lines[0].add(hebrew ? u"לכבוד" : u"To", Html::Markup);
    if (const QStringView code = trimmed(v[CardCode]); !code.isEmpty()) {
        lines[2].add(hebrew ? u"קוד: " : u"Code: ", Html::Markup);
        lines[2].add(code, Html::Text);
    }
    if (const QStringView attn = trimmed(v[Attn]); !attn.isEmpty()) {
        if (options_.showAttn)
            lines[3].add(hebrew ? u"לידי:" : u"Attn:", Html::Markup);
        lines[3].add(attn, Html::Text);
        const QStringView department = trimmed(v[Department]);
        if (options_.useTitle[kDepartmentLine] && !department.isEmpty()) {
            lines[3].add(options_.deptNewLine ? u"<br>" : u", ", Html::Markup);
            lines[3].add(department, Html::Text);
        }
    }
    lines[11].add(fixedAbove_, Html::Text);
    lines[1].add(QStringView(v[CardName]).left(kLineWidth), Html::Text);
    lines[12].add(fixedBelow_, Html::Text);
    if (options_.allContacts && options_.useContactAddress && v[CntctAddrs].size() > 5) {
        lines[4].add(v[CntctAddrs], Html::TextCrCommaBr);
    } else {
        lines[4].add(trimmed(v[MailAddres]), Html::TextCrBr);
        lines[7].add(trimmed(v[MailBlock]), Html::Text);
        lines[5].add(trimmed(v[MailCity]), Html::Text);
        lines[5].add(u"&nbsp;&nbsp;&nbsp;&nbsp;", Html::Markup);
        lines[5].add(trimmed(v[MailZipCod]), Html::Text);
    }
    lines[8].add(trimmed(v[MailCounty]), Html::Text);
    lines[9].add(trimmed(v[MailState]), Html::Text);
    lines[10].add(trimmed(v[MailCountry]), Html::Text);

    const auto& prefixes = hebrew ? hebrewPrefix_ : otherPrefix_;
    for (const int line : options_.labFormat == 1 ? kContactFirstOrder : kStandardOrder) {
        if (line == kDepartmentLine || !options_.useTitle[line] || lines[line].empty())
            continue;
        file.bytes(prefixes[line]);
        for (int i = 0; i < lines[line].count; ++i)
            file.put(lines[line].pieces[i].text, lines[line].pieces[i].mode);
        file.put(u"</td></tr>");
        file.endLine();
    }
}

}  // namespace pelmar

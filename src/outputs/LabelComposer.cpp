#include "outputs/LabelComposer.h"

#include "common/Fields.h"
#include "db/Recordset.h"
#include "outputs/HtmlFile.h"

#include <array>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

constexpr std::array<int, 13> kStandardOrder = {0, 11, 1, 12, 2, 3, 6, 4, 7, 5, 8, 9, 10};
constexpr std::array<int, 13> kContactFirstOrder = {0, 11, 3, 12, 1, 2, 6, 4, 7, 5, 8, 9, 10};
constexpr int kDepartmentLine = 6;
constexpr qsizetype kLineWidth = 30;

// A column of the row; a column the statement does not select (the document address has no
// block, state or country) reads as Null.
QVariant column(const Recordset& row, const QString& name)
{
    return row.hasColumn(name) ? row.value(name) : QVariant();
}

QString cut(const QVariant& value, qsizetype width)
{
    return FieldText(value).left(width);
}

QString crToBr(const QString& text)
{
    return QString(text).replace(u'\r', u"<br>"_s);
}

QString crCommaToBr(const QString& text)
{
    return QString(text).replace(u'\r', u"<br>"_s).replace(u',', u"<br>"_s);
}

}  // namespace

bool IsHebrew(const QString& text)
{
    return std::any_of(text.begin(), text.end(), [](QChar c) { return c.unicode() >= 0x05D0 && c.unicode() <= 0x05EA; });
}

LabelComposer::LabelComposer(const LabelPage& page, const LabelDefTable& styles)
    : page_(page), fixedAbove_(htmlText(styles[11].FixedText.left(kLineWidth))),
      fixedBelow_(htmlText(styles[12].FixedText.left(kLineWidth)))
{
}

QStringList LabelComposer::lines(const Recordset& row) const
{
    QVariant direction = column(row, u"MailAddres"_s);
    if (direction.isNull())
        direction = column(row, u"MailCity"_s);
    const bool hebrew = IsHebrew(FieldText(direction));

    std::array<QString, 13> text;
    text[0] = hebrew ? u"לכבוד"_s : u"To"_s;
    const QString code = TrimField(column(row, u"CardCode"_s));
    if (!code.isEmpty())
        text[2] = (hebrew ? u"קוד: "_s : u"Code: "_s) + htmlText(code);
    const QString attn = TrimField(column(row, u"Attn"_s));
    if (!attn.isEmpty()) {
        const QString word = page_.showAttn ? (hebrew ? u"לידי:"_s : u"Attn:"_s) : QString();
        text[3] = word + htmlText(attn);
        const QString department = TrimField(column(row, u"Department"_s));
        if (page_.enabled[kDepartmentLine] && !department.isEmpty())
            text[3] += (page_.deptNewLine ? u"<br>"_s : u", "_s) + htmlText(department);
    }
    text[11] = fixedAbove_;
    text[1] = htmlText(cut(column(row, u"CardName"_s), kLineWidth));
    text[12] = fixedBelow_;

    const QVariant contactAddress = column(row, u"CntctAddrs"_s);
    if (page_.contactAddressAllowed && !contactAddress.isNull() && contactAddress.toString().size() > 5) {
        text[4] = crCommaToBr(htmlText(contactAddress.toString()));
    } else {
        text[4] = crToBr(htmlText(TrimField(column(row, u"MailAddres"_s))));
        text[7] = htmlText(TrimField(column(row, u"MailBlock"_s)));
        text[5] = htmlText(TrimField(column(row, u"MailCity"_s))) + u"&nbsp;&nbsp;&nbsp;&nbsp;"_s
                  + htmlText(TrimField(column(row, u"MailZipCod"_s)));
    }
    text[8] = htmlText(TrimField(column(row, u"MailCounty"_s)));
    text[9] = htmlText(TrimField(column(row, u"MailState"_s)));
    text[10] = htmlText(TrimField(column(row, u"MailCountry"_s)));

    const QString cls = hebrew ? u" class=L"_s : u" class=LE"_s;
    const auto& order = page_.templateIndex == 1 ? kContactFirstOrder : kStandardOrder;
    QStringList printed;
    for (const int line : order) {
        if (line != kDepartmentLine && page_.enabled[line] && !text[line].isEmpty())
            printed << u"    <tr"_s + cls + QString::number(line) + u"><td>"_s + text[line] + u"</td></tr>"_s;
    }
    return printed;
}

}  // namespace pelmar

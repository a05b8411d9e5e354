#include "outputs/RecipientList.h"

#include "common/Fields.h"
#include "common/TextFileWriter.h"
#include "db/DatabaseClient.h"

#include <QList>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

// A column of the list: its header cell and how a row fills it.
struct ListColumn {
    QString header;
    QString column;
    QString cardColumn;  // the card's value when the contact's is Null or empty; empty for none
    bool leftAligned;
};

const ListColumn kZip{u"מיקוד"_s, u"MailZipCod"_s, {}, false};
const ListColumn kCity{u"עיר"_s, u"MailCity"_s, {}, false};
const ListColumn kAddress{u"כתובת"_s, u"MailAddres"_s, {}, false};
const ListColumn kFax{u"פקס"_s, u"CFax"_s, u"Fax"_s, true};
const ListColumn kDepartment{u"מחלקה"_s, u"Notes1"_s, {}, false};
const ListColumn kPosition{u"תפקיד"_s, u"Position"_s, {}, false};
const ListColumn kEmail{u"דואר אלקטרוני"_s, u"CMail"_s, u"Email"_s, true};
const ListColumn kMobile{u"טלפון סלולרי"_s, u"CMobile"_s, u"Mobile"_s, true};
const ListColumn kContact{u"איש קשר"_s, u"Attn"_s, {}, false};
const ListColumn kName{u"שם"_s, u"CardName"_s, {}, false};

struct ListKind {
    const char16_t* subtitle;
    QList<ListColumn> columns;
};

ListKind kindOf(short kind)
{
    switch (kind) {
    case 3: return {u"דיוור ישיר בפקס", {kFax, kDepartment, kPosition, kContact, kName}};
    case 4: return {u"דיוור ישיר בדואר אלקטרוני", {kEmail, kContact, kName}};
    case 5: return {u"דיוור ישיר בהודעות sms", {kMobile, kContact, kName}};
    default: return {u"דיוור ישיר במעטפות דואר", {kZip, kCity, kAddress, kContact, kName}};
    }
}

void writeHead(TextFileWriter& file, const ListKind& kind, const QDate& today)
{
    for (const char16_t* line :
         {u"<HTML>", u"<HEAD>", u"<TITLE>טרבל מערכות מידע מציגה</TITLE>",
          u"<meta http-equiv='Content-Type' content='text/html; charset=windows-1255'>",
          u"<style>.MyClass1{font-size : 10pt; color: blue; font-family: Arial}",
          u"       .Title1 {font-size : 12pt; color: blue; font-family: Arial; font-weight : bold; direction: rtl}",
          u"       TD {font-size : 9pt; color: black; font-family: Arial}", u"</style>", u"</HEAD>",
          u"<BODY class=MyClass1 BGCOLOR='#FFFFFF' TEXT='#000000' LINK='#0000FF' VLINK='#800080'>"})
        file.line(line);
    file.line(u"<p class=Title1 align='left'>"_s + today.toString(u"dd/MM/yyyy"_s) + u"</p>"_s);
    file.line(u"<p class=Title1 align='right'>נובר-דיוור ל-SAP Business One</p>");
    file.line(u"<p align='right'>"_s + QString::fromUtf16(kind.subtitle) + u"</p>"_s);
    file.line(u"<table width='100%' border='0' cellpadding='1' cellspacing='1'>");
    const QString separator = u"  <tr><td colspan='%1'><hr noshade size='2'></td></tr>"_s.arg(kind.columns.size());
    file.line(separator);
    file.line(u"  <tr valign='middle' bgcolor='white' align='right'>");
    for (const ListColumn& column : kind.columns)
        file.line(u"    <td valign='middle'>"_s + column.header + u"</td>"_s);
    file.line(u"  </tr>");
    file.line(separator);
}

// A list column bound to the positions of its columns in one recordset.
struct BoundColumn {
    int value;
    int card;  // -1 when the column has no card fallback
    bool leftAligned;
};

QList<BoundColumn> bind(const QList<ListColumn>& columns, const Recordset& rows)
{
    QList<BoundColumn> bound;
    for (const ListColumn& column : columns) {
        const int card = column.cardColumn.isEmpty() ? -1 : rows.requiredColumn(column.cardColumn);
        bound.append({rows.requiredColumn(column.column), card, column.leftAligned});
    }
    return bound;
}

void writeCell(TextFileWriter& file, const BoundColumn& column, const Recordset& row)
{
    const QVariant* value = &row.valueAt(column.value);
    if (column.card >= 0 && (value->isNull() || value->toString().isEmpty()))
        value = &row.valueAt(column.card);
    file.bytes(column.leftAligned ? QByteArrayLiteral("    <td align='left'>") : QByteArrayLiteral("    <td>"));
    if (value->isNull())
        file.bytes(QByteArrayLiteral("&nbsp;"));
    else
        file.put(value->toString(), Html::Text);
    file.bytes(QByteArrayLiteral("</td>\r\n"));
}

}  // namespace

qint64 labelPagesNeeded(qint64 count, const ListPageLayout& layout)
{
    const qint64 labels = qint64(layout.copies) * count;
    const qint64 perPage = qint64(layout.rows) * layout.cols;
    const qint64 pages = labels / perPage;
    return pages * perPage < labels ? pages + 1 : pages;
}

void writeRecipientList(const QString& path, short kind, const ListQuery& query,
                        const std::optional<ListPageLayout>& pages, const QDate& today)
{
    const ListKind list = kindOf(kind);
    TextFileWriter file(path, true);
    writeHead(file, list, today);
    auto rows = query.client.open(query.statement, query.connString);
    if (rows->eof())
        return file.close();
    const QList<BoundColumn> columns = bind(list.columns, *rows);
    qint64 count = 0;
    for (; !rows->eof(); rows->moveNext()) {
        if (query.wanted && !query.wanted(FieldText(rows->value(u"CardCode"_s))))
            continue;
        ++count;
        file.bytes(QByteArrayLiteral("  <tr valign='middle' bgcolor='#FFFFFF' align='right'>\r\n"));
        for (const BoundColumn& column : columns)
            writeCell(file, column, *rows);
        file.bytes(QByteArrayLiteral("  </tr>\r\n"));
    }
    file.line(u"</table>");
    file.line(u"<hr noshade width='100%' size='2'>");
    file.line(u"<p class=Title1 align='right'>מספר הכרטיסים ברשימה: "_s + QString::number(count) + u"</p>"_s);
    if (kind == 2 && pages)
        file.line(u"<p class=Title1 align='right'>מספר הדפים הנדרשים: "_s
                  + QString::number(labelPagesNeeded(count, *pages)) + u"</p>"_s);
    for (const char16_t* line :
         {u"<br>", u"<p class=Title1 align='center'>טרבל מערכות מידע</p>", u"</BODY>", u"</HTML>"})
        file.line(line);
    file.close();
}

}  // namespace pelmar

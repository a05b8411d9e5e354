#include "cardpage/CardPage.h"

#include "common/Fields.h"
#include "common/TextFileWriter.h"
#include "db/DatabaseClient.h"
#include "selection/WhereBuilder.h"

#include <QStringList>

#include <array>
#include <functional>
#include <optional>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

const char16_t* const kHead[] = {
    u"<HEAD>",
    u"<TITLE>כרטיס לקוח/ספק</TITLE>",
    u"<meta http-equiv='Content-Type' content='text/html; charset=windows-1255'>",
    u"<style>",
    u"  BODY {direction:rtl; background:#FFFFFF ;margin-top:10; margin-left:10; margin-right:10; vertical-align:top;}",
    u"  TABLE {border: thin solid #ADD6EA}",
    u"  TD {font-size : 9pt; color: black; font-family: arial; text-align: right}",
    u"  .TblClean {border: none}",
    u"  .Cap {background:#5F8EBE; font-size : 9pt; color: white; font-family: Arial; font-weight: bold}",
    u"  .GCap {font-size : 9pt; color: #5F8EBE; font-family: Arial; font-weight: bold}",
    u"  .Title1 {font-size : 12pt; color: blue; font-family: arial; font-weight : bold;}",
    u"  .Tarvel {font-size : 8pt; color: black; font-family: arial;}",
    u"</style>",
    u"</HEAD>",
    u"<BODY TEXT='#000000' LINK='#0000FF' VLINK='#800080'>",
    u"<table class=TblClean width='100%' border='0' cellpadding='3' cellspacing='3'>",
};

struct CardProperties {
    bool anySet;
    QStringList names;
};

const QString kRowStart = u"  <tr valign='middle' bgcolor='#FFFFFF' align='right'>"_s;

QString cardTypeName(const QString& type)
{
    if (type == u"C"_s)
        return u"לקוח"_s;
    if (type == u"S"_s)
        return u"ספק"_s;
    if (type == u"L"_s)
        return u"ליד"_s;
    return {};
}

class CardPageWriter {
public:
    CardPageWriter(TextFileWriter& file, const DatabaseClient& client, const QString& connString, const QString& code)
        : file_(file), client_(client), connString_(connString), where_(u" Where OCRD.CardCode = N'"_s + code + u"'"_s),
          code_(code)
    {}

    void head()
    {
        const QString address = QString::fromUtf16(kCardPageAddress);
        file_.line(u"<HTML>");
        file_.line(u"<!-- saved from url=(%1)%2 -->"_s.arg(address.size(), 4, 10, QChar(u'0')).arg(address));
        for (const char16_t* line : kHead)
            file_.line(line);
    }

    // Whether some property of the card is set, and the names OCQG gives the set ones, in its
    // order; std::nullopt when there is no such card.
    std::optional<CardProperties> properties()
    {
        QString select = u"Select OCRD.CardCode"_s;
        for (int n = 1; n <= 64; ++n)
            select += u", OCRD.QryGroup"_s + QString::number(n);
        auto card = client_.open(select + u" From OCRD"_s + where_, connString_);
        if (card->eof())
            return std::nullopt;
        std::array<bool, 65> set{};
        bool any = false;
        for (int n = 1; n <= 64; ++n)
            any |= set[n] = FieldText(card->value(u"QryGroup"_s + QString::number(n))) == u"Y"_s;
        card->close();
        CardProperties found{any, {}};
        if (!any)
            return found;
        auto groups = client_.open(u"Select OCQG.GroupCode, OCQG.GroupName From OCQG"_s, connString_);
        for (; !groups->eof(); groups->moveNext()) {
            const int number = groups->value(u"GroupCode"_s).toInt();
            if (number >= 1 && number <= 64 && set[number])
                found.names << FieldText(groups->value(u"GroupName"_s));
        }
        return found;
    }

    // The general blocks; false when the card has no row joined with its group.
    bool general(const CardProperties& properties)
    {
        auto card = client_.open(u"Select OCRD.CardCode, OCRD.CardName, OCRD.CardFName, OCRD.CardType, OCRG.GroupName, "
                                 "OCRD.LicTradNum, OCRD.Phone1, OCRD.Phone2, OCRD.Cellular, OCRD.Fax, OCRD.E_Mail, "
                                 "OCRD.Notes, OCRD.Free_Text From OCRD, OCRG"_s
                                     + where_ + u" And OCRG.GroupCode = OCRD.GroupCode"_s,
                                 connString_);
        if (card->eof())
            return false;
        const Recordset& row = *card;
        file_.line(u"<tr><td>");
        file_.line(u" <table width='100%' border='0' cellpadding='2' cellspacing='2'>");
        block({u"קוד כרטיס"_s, u"שם כרטיס"_s, u"סיווג"_s, u"השתייכות"_s}, [&] {
            cell(u"     <td><b>", row.value(u"CardCode"_s), u"</b></td>");
            cell(u"     <td><b>", row.value(u"CardName"_s), u"</b></td>");
            markupCell(cardTypeName(FieldText(row.value(u"CardType"_s))));
            cell(u"     <td>", row.value(u"GroupName"_s));
        });
        valueBlock({u"טלפון 1"_s, u"טלפון 2"_s, u"טלפון נייד"_s, u"פקס"_s},
                   {u"Phone1"_s, u"Phone2"_s, u"Cellular"_s, u"Fax"_s}, row);
        valueBlock({u"שם לועזי"_s, u"עוסק מורשה"_s, u"דואל"_s, u"הערות"_s},
                   {u"CardFName"_s, u"LicTradNum"_s, u"E_Mail"_s, u"Notes"_s}, row);
        if (properties.anySet)
            block({u"מאפיינים"_s}, [&] { cell(u"     <td>", properties.names.join(u", "_s)); });
        file_.line(u" </table>");
        file_.line(u"</td></tr>");
        return true;
    }

    void addressesOlder()
    {
        auto card = client_.open(u"Select OCRD.Address, OCRD.ZipCode, OCRD.City, OCRD.County, C1.Name NCountry"
                                 ", OCRD.MailAddres, OCRD.MailZipCod, OCRD.MailCity, MailCounty, C2.Name NMailCountr"
                                 " From (OCRD Left Join OCRY C1 On C1.Code = OCRD.Country)"
                                 " Left Join OCRY C2 On (C2.Code = OCRD.MailCountr)"_s
                                     + where_,
                                 connString_);
        if (card->eof())
            return;
        const auto text = [&](const char16_t* column) { return FieldText(card->value(QString::fromUtf16(column))); };
        if ((text(u"Address") + text(u"City") + text(u"MailAddres") + text(u"MailCity")).isEmpty())
            return;
        sectionStart(u"כתובות", {u"סוג"_s, u"רחוב/תא דואר"_s, u"עיר"_s, u"מיקוד"_s, u"מחוז"_s, u"ארץ"_s});
        if (!(text(u"Address") + text(u"City")).isEmpty())
            row(u"כתובת למשלוח", {u"Address"_s, u"City"_s, u"ZipCode"_s, u"County"_s, u"NCountry"_s}, *card);
        if (!(text(u"MailAddres") + text(u"MailCity")).isEmpty() && text(u"MailAddres") != text(u"Address"))
            row(u"כתובת לדואר", {u"MailAddres"_s, u"MailCity"_s, u"MailZipCod"_s, u"MailCounty"_s, u"NMailCountr"_s},
                *card);
        sectionEnd();
    }

    void addressesNewer()
    {
        auto rows = client_.open(u"Select CRD1.Address, CRD1.Street, CRD1.Block, CRD1.City, CRD1.ZipCode, CRD1.County"
                                 ", OCST.Name NState, OCRY.Name NCountry"
                                 " From (CRD1 Left Join OCRY On OCRY.Code = CRD1.Country)"
                                 " Left Join OCST On (OCST.Code = CRD1.State And OCST.Country = CRD1.Country)"
                                 " Where CRD1.CardCode = N'"_s
                                     + code_ + u"'"_s,
                                 connString_);
        if (rows->eof())
            return;
        sectionStart(u"כתובות",
                     {u"סוג"_s, u"רחוב/תא דואר"_s, u"גוש"_s, u"עיר"_s, u"מיקוד"_s, u"מחוז"_s, u"מדינה"_s, u"ארץ"_s});
        for (; !rows->eof(); rows->moveNext())
            row(nullptr,
                {u"Address"_s, u"Street"_s, u"Block"_s, u"City"_s, u"ZipCode"_s, u"County"_s, u"NState"_s,
                 u"NCountry"_s},
                *rows);
        sectionEnd();
    }

    void contacts()
    {
        auto rows = client_.open(u"Select OCPR.Name, OCPR.Position, OCPR.Address, OCPR.E_MailL"
                                 ", OCPR.Tel1, OCPR.Tel2, OCPR.Cellolar, OCPR.Fax"
                                 ", OCPR.Pager, OCPR.Notes1, OCPR.Notes2 From OCPR Where OCPR.CardCode = N'"_s
                                     + code_ + u"'"_s,
                                 connString_);
        if (rows->eof())
            return;
        sectionStart(u"אנשי קשר",
                     {u"שם"_s, u"תפקיד"_s, u"טל. 1"_s, u"טל. 2"_s, u"טל. נייד"_s, u"פקס"_s, u"EMail"_s, u"זימונית"_s,
                      u"הערות 1"_s, u"הערות 2"_s});
        for (; !rows->eof(); rows->moveNext())
            row(nullptr,
                {u"Name"_s, u"Position"_s, u"Tel1"_s, u"Tel2"_s, u"Cellolar"_s, u"Fax"_s, u"E_MailL"_s, u"Pager"_s,
                 u"Notes1"_s, u"Notes2"_s},
                *rows);
        sectionEnd();
    }

    void foot()
    {
        for (const char16_t* line :
             {u"</table>", u"<p class=Tarvel align='center'>טרבל מערכות מידע</p>", u"</BODY>", u"</HTML>"})
            file_.line(line);
    }

private:
    void cell(QStringView prefix, const QVariant& value, QStringView suffix = u"</td>")
    {
        file_.put(prefix);
        if (value.isNull())
            file_.put(u"&nbsp;");
        else
            file_.put(value.toString(), Html::Text);
        file_.put(suffix);
        file_.endLine();
    }

    void markupCell(const QString& text) { file_.line(u"     <td>"_s + text + u"</td>"_s); }

    void block(const QStringList& captions, const std::function<void()>& values)
    {
        for (const char16_t* line :
             {u"  <tr align='right'>", u"   <td>",
              u"   <table class=TblClean width='100%' border='0' cellpadding='2' cellspacing='2'>",
              u"    <tr align='right'>"})
            file_.line(line);
        for (const QString& caption : captions)
            file_.line(u"     <td class=Cap>"_s + caption + u"</td>"_s);
        file_.line(u"    </tr>");
        file_.line(u"    <tr align='right'>");
        values();
        for (const char16_t* line : {u"    </tr>", u"    </table>", u"   </td>", u"  </tr>"})
            file_.line(line);
    }

    void valueBlock(const QStringList& captions, const QStringList& columns, const Recordset& row)
    {
        block(captions, [&] {
            for (const QString& column : columns)
                cell(u"     <td>", row.value(column));
        });
    }

    void sectionStart(const char16_t* title, const QStringList& captions)
    {
        file_.line(u"<tr><td class=GCap align=right>"_s + QString::fromUtf16(title) + u"</td></tr>"_s);
        file_.line(u"<tr><td>");
        file_.line(u" <table width='100%' border='0' cellpadding='2' cellspacing='2'>");
        file_.line(u"  <tr bgcolor='#FFFFFF' align='right'>");
        for (const QString& caption : captions)
            file_.line(u"    <td class=Cap>"_s + caption + u"</td>"_s);
        file_.line(u"  </tr>");
    }

    void row(const char16_t* kind, const QStringList& columns, const Recordset& values)
    {
        file_.line(kRowStart);
        if (kind)
            file_.line(u"    <td>"_s + QString::fromUtf16(kind) + u"</td>"_s);
        for (const QString& column : columns)
            cell(u"    <td>", values.value(column));
        file_.line(u"  </tr>");
    }

    void sectionEnd()
    {
        file_.line(u" </table>");
        file_.line(u"</td></tr>");
    }

    TextFileWriter& file_;
    const DatabaseClient& client_;
    const QString& connString_;
    QString where_;
    QString code_;
};

}  // namespace

void writeCardPage(const QString& path, const QString& cardCode, const DatabaseClient& client,
                   const QString& connString, short level)
{
    TextFileWriter file(path, true);
    CardPageWriter page(file, client, connString, sqlText(cardCode));
    page.head();
    const auto properties = page.properties();
    if (!properties || !page.general(*properties))
        return file.close();
    if (level == 1)
        page.addressesNewer();
    else
        page.addressesOlder();
    page.contacts();
    page.foot();
    file.close();
}

}  // namespace pelmar

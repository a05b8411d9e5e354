#include "options/Lists.h"

using namespace Qt::StringLiterals;

namespace pelmar {

const QStringList& outputTypeEntries()
{
    static const QStringList entries
        = {u"מדבקות למעטפות"_s, u"מכתבים בפקס"_s, u"דואר אלקטרוני"_s, u"לטלפונים סלולריים"_s, u"הדפסת מכתבים"_s};
    return entries;
}

const QStringList& cardTypeEntries()
{
    static const QStringList entries = {u"לקוחות"_s, u"ספקים"_s, u"לידים"_s};
    return entries;
}

const QStringList& phoneTypeEntries()
{
    static const QStringList entries
        = {u"טלפון 1"_s, u"טלפון 2"_s, u"טלפון נייד"_s, u"פקס"_s, u"טלפון נייד - איש קשר"_s};
    return entries;
}

const QStringList& documentTypeEntries()
{
    static const QStringList entries
        = {u"חשבוניות מס"_s, u"חש. מס זיכוי"_s, u"תעודות משלוח"_s, u"הזמנות רכש"_s,  u"הצעות מחיר"_s,
           u"קבלות"_s,       u"שיקים"_s,        u"תש. לספקים"_s,   u"תשלומי אשראי"_s};
    return entries;
}

const QStringList& byDocumentEntries()
{
    static const QStringList entries = {u"הופקו"_s, u"לא הופקו"_s};
    return entries;
}

const QStringList& sortByEntries()
{
    static const QStringList entries
        = {u"מפתח לקוח"_s, u"שם לקוח"_s, u"עיר"_s, u"מיקוד"_s, u"איש קשר ומיקוד"_s, u"טלפון סלולרי"_s};
    return entries;
}

const QStringList& sortDirectionEntries()
{
    static const QStringList entries = {u"עולה"_s, u"יורד"_s};
    return entries;
}

const QStringList& labelTemplateEntries()
{
    static const QStringList entries = {u"תבנית סטנדרטית"_s, u"איש קשר מעל שם חברה"_s};
    return entries;
}

const QStringList& addressSourceEntries()
{
    static const QStringList entries = {u"כתובת למשלוח דואר"_s, u"כתובת בכרטיס"_s, u"כתובת מהמסמכים"_s};
    return entries;
}

const QStringList& smtpSecurityEntries()
{
    static const QStringList entries
        = {u"הצפנה (STARTTLS) כשהשרת מציע"_s, u"הצפנה (STARTTLS) חובה"_s, u"הצפנה מלאה (TLS) מההתחלה"_s};
    return entries;
}

const QList<MergeRow>& mergeRows()
{
    static const QList<MergeRow> rows = {
        {u"CustomerName"_s, u"שם לקוח"_s, u"CardName"_s, false},
        {u"ContactName"_s, u"איש קשר"_s, u"Attn"_s, false},
        {u"Position"_s, u"תפקיד"_s, u"Position"_s, false},
        {u"Department"_s, u"מחלקה"_s, u"Notes1"_s, false},
        {u"Field4"_s, {}, {}, true},
        {u"Field5"_s, {}, {}, true},
        {u"Field6"_s, {}, {}, true},
        {u"Field7"_s, {}, {}, true},
    };
    return rows;
}

}  // namespace pelmar

#include "demo/CompanyGenerator.h"

#include "demo/CompanySchema.h"

#include <QDate>
#include <QStringList>

#include <array>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

// SplitMix64: small, fast and the same on every platform and library.
class Random {
public:
    explicit Random(std::uint64_t seed) : state_(seed) {}
    std::uint64_t next()
    {
        std::uint64_t z = (state_ += 0x9E3779B97F4A7C15ULL);
        z = (z ^ (z >> 30)) * 0xBF58476D1CE4E5B9ULL;
        z = (z ^ (z >> 27)) * 0x94D049BB133111EBULL;
        return z ^ (z >> 31);
    }
    int below(int n) { return static_cast<int>(next() % static_cast<std::uint64_t>(n)); }
    bool chance(int percent) { return below(100) < percent; }
    template <typename List>
    auto pick(const List& list)
    {
        return list.at(below(static_cast<int>(list.size())));
    }
    QString digits(int count)
    {
        QString text;
        for (int i = 0; i < count; ++i)
            text += QChar(u'0' + below(10));
        return text;
    }

private:
    std::uint64_t state_;
};

const QStringList kHebrewLast = {u"כהן"_s,    u"לוי"_s,   u"מזרחי"_s,   u"פרץ"_s,    u"ביטון"_s, u"אברהם"_s,
                                 u"פרידמן"_s, u"שפירא"_s, u"גולדברג"_s, u"אזולאי"_s, u"חדד"_s,   u"רוזנברג"_s};
const QStringList kHebrewFirst
    = {u"משה"_s, u"יוסי"_s, u"דנה"_s, u"רונית"_s, u"אבי"_s, u"מיכל"_s, u"נועה"_s, u"דוד"_s, u"שרה"_s, u"איתן"_s};
const QStringList kHebrewSuffix = {u"בע\"מ"_s, u"ובניו"_s, u"שיווק והפצה"_s, u"תעשיות"_s, u"סחר"_s};
const QStringList kEnglishLast
    = {u"Smith"_s, u"Johnson"_s, u"Brown"_s, u"Miller"_s, u"Davis"_s, u"Wilson"_s, u"Taylor"_s, u"Clark"_s};
const QStringList kEnglishFirst = {u"John"_s, u"Mary"_s, u"Robert"_s, u"Linda"_s, u"James"_s, u"Susan"_s};
const QStringList kEnglishSuffix = {u"Ltd"_s, u"Trading"_s, u"& Co"_s, u"Industries"_s, u"Imports"_s};
const QStringList kHebrewCities
    = {u"חיפה"_s, u"תל אביב"_s, u"ירושלים"_s, u"באר שבע"_s, u"נתניה"_s, u"קריית שמונה"_s, u"ראשון לציון"_s, u"עכו"_s};
const QStringList kEnglishCities = {u"Springfield"_s, u"London"_s, u"New York"_s, u"Berlin"_s, u"Boston"_s};
const QStringList kHebrewStreets = {u"הרצל"_s, u"ויצמן"_s, u"הגפן"_s, u"בן גוריון"_s, u"ז'בוטינסקי"_s};
const QStringList kEnglishStreets = {u"Main St"_s, u"High Street"_s, u"Oak Ave"_s, u"Church Rd"_s};
const QStringList kPositions = {u"מנהל רכש"_s, u"מנכ\"ל"_s, u"Purchasing Manager"_s, u"CFO"_s, u"מזכירה"_s};
const QStringList kDepartments = {u"הנהלת חשבונות"_s, u"רכש"_s, u"Sales"_s, u"שיווק"_s};
const QStringList kForeignCountries = {u"US"_s, u"GB"_s, u"DE"_s};

struct Sales {
    int code;
    QVariant name;
};

struct DocumentType {
    const char16_t* table;
    bool lines;
    bool suppliersOnly;
};

const std::array<DocumentType, 9> kDocumentTypes = {{{u"OINV", true, false},
                                                     {u"ORIN", true, false},
                                                     {u"ODLN", false, false},
                                                     {u"OPOR", false, true},
                                                     {u"OQUT", false, false},
                                                     {u"ORCT", false, false},
                                                     {u"OCHO", false, true},
                                                     {u"OVPM", false, true},
                                                     {u"OCRV", false, false}}};

QVariant null()
{
    return QVariant(QMetaType::fromType<QString>());
}

class Generator {
public:
    Generator(const CompanyOptions& options, RowSink& sink) : options_(options), sink_(sink), random_(options.seed) {}

    void run()
    {
        writeLookups();
        for (int i = 1; i <= options_.cards; ++i)
            writeCard(i);
    }

private:
    void add(const QString& table, const QVariantList& values) { sink_.add(tableNamed(table), values); }

    void writeLookups()
    {
        add(u"CINF"_s, {options_.companyName, options_.schemaLevel == 1 ? 900045 : 61012});
        const QList<std::tuple<int, QString, QString>> groups
            = {{100, u"לקוחות רגילים"_s, u"C"_s}, {101, u"לקוחות VIP"_s, u"C"_s}, {102, u"סיטונאים"_s, u"C"_s},
               {103, u"Export"_s, u"C"_s},        {104, u"מוסדות"_s, u"C"_s},     {105, u"ספקים מקומיים"_s, u"S"_s},
               {106, u"ספקי חו\"ל"_s, u"S"_s},    {107, u"קבלני משנה"_s, u"S"_s}, {108, u""_s, u"S"_s}};
        for (const auto& [code, name, type] : groups)
            add(u"OCRG"_s, {code, name, type});
        for (int n = 1; n <= options_.properties; ++n)
            add(u"OCQG"_s, {n, n == 13 ? QString() : u"מאפיין %1"_s.arg(n)});
        const QList<Sales> sales = {{-1, u"-ללא איש מכירות-"_s},
                                    {1, u"דנה לוי"_s},
                                    {2, u"יוסי כהן"_s},
                                    {3, u"  Mark Smith  "_s},
                                    {4, u""_s},
                                    {5, u"רונית אברהם"_s},
                                    {6, null()},
                                    {7, u"O'Neil & <Partners>"_s}};
        for (const Sales& employee : sales)
            add(u"OSLP"_s, {employee.code, employee.name});
        add(u"OCRY"_s, {u"IL"_s, u"ישראל"_s});
        add(u"OCRY"_s, {u"US"_s, u"United States"_s});
        add(u"OCRY"_s, {u"GB"_s, u"United Kingdom"_s});
        add(u"OCRY"_s, {u"DE"_s, u"Germany"_s});
        add(u"OCST"_s, {u"NY"_s, u"US"_s, u"New York"_s});
        add(u"OCST"_s, {u"CA"_s, u"US"_s, u"California"_s});
    }

    // Two picks joined; the picks are sequenced so that a seed gives the same data everywhere.
    QString joined(const QStringList& first, const QStringList& second)
    {
        const QString a = random_.pick(first);
        const QString b = random_.pick(second);
        return a + u' ' + b;
    }

    QString personName(bool hebrew)
    {
        return hebrew ? joined(kHebrewFirst, kHebrewLast) : joined(kEnglishFirst, kEnglishLast);
    }

    QString cardName(int i, bool hebrew)
    {
        if (i % 53 == 0)
            return u"O'Brien & Sons <Ltd>"_s;
        if (i % 59 == 0)
            return u"חברת הסחר והשיווק הבינלאומית של הצפון בע\"מ"_s;
        if (random_.chance(30))
            return personName(hebrew);
        return hebrew ? joined(kHebrewLast, kHebrewSuffix) : joined(kEnglishLast, kEnglishSuffix);
    }

    QVariant phone(int nullPercent, const QString& areaPrefix)
    {
        const int roll = random_.below(100);
        if (roll < nullPercent)
            return null();
        if (roll < nullPercent + 5)
            return QString();
        switch (random_.below(4)) {
        case 0: return areaPrefix + u'-' + random_.digits(7);
        case 1: {
            const QString exchange = random_.digits(3);
            return areaPrefix + u' ' + exchange + u' ' + random_.digits(4);
        }
        case 2: return u"+972-"_s + areaPrefix.mid(1) + u'-' + random_.digits(7);
        default: return areaPrefix + random_.digits(7);
        }
    }

    QVariant mobile(int nullPercent) { return phone(nullPercent, u"05"_s + QString::number(random_.below(9) + 1)); }

    QVariant email(const QString& local, int nullPercent)
    {
        const int roll = random_.below(100);
        if (roll < nullPercent)
            return null();
        if (roll < nullPercent + 4)
            return QString();
        if (roll < nullPercent + 7)
            return u"no-address-given"_s;
        return local + u'@' + random_.pick(QStringList{u"example.co.il"_s, u"mail.example.com"_s});
    }

    struct Place {
        QVariant street;
        QString city;
        QString zip;
        QString county;
        QString country;
        QVariant state;
        QVariant block;
    };

    Place place(bool hebrew)
    {
        Place p;
        const int number = random_.below(120) + 1;
        p.street = hebrew ? random_.pick(kHebrewStreets) + u' ' + QString::number(number)
                          : QString::number(number) + u' ' + random_.pick(kEnglishStreets);
        p.city = hebrew ? random_.pick(kHebrewCities) : random_.pick(kEnglishCities);
        p.zip = random_.digits(hebrew ? 7 : 5);
        p.county = hebrew ? u"מחוז "_s + random_.pick(QStringList{u"הצפון"_s, u"המרכז"_s, u"הדרום"_s}) : u"North"_s;
        p.country = hebrew ? u"IL"_s : random_.pick(kForeignCountries);
        p.state = p.country == u"US"_s ? QVariant(random_.pick(QStringList{u"NY"_s, u"CA"_s})) : null();
        p.block = random_.chance(30) ? QVariant(u"גוש "_s + random_.digits(4)) : null();
        return p;
    }

    void writeCard(int i)
    {
        const int typeRoll = random_.below(10);
        const QString type = typeRoll < 7 ? u"C"_s : typeRoll < 9 ? u"S"_s : u"L"_s;
        const QString code = (i % 211 == 0 ? type + u'\'' : type) + u"%1"_s.arg(i, 7, 10, QChar(u'0'));
        const bool hebrew = random_.below(3) != 0;
        const QString name = cardName(i, hebrew);
        const int group = type == u"S"_s ? 105 + random_.below(4) : 100 + random_.below(5);

        const int contactCount = random_.below(5);
        QList<int> contactCodes;
        QStringList contactNames;
        for (int k = 0; k < contactCount; ++k) {
            contactCodes << ++lastContact_;
            contactNames << personName(hebrew || random_.chance(20));
        }
        QVariant mainContact = contactNames.isEmpty() ? null() : QVariant(contactNames.first());
        if (contactNames.size() > 1 && random_.chance(15))
            mainContact = contactNames.last();

        const Place bill = place(hebrew);
        Place mail = bill;
        const int mailRoll = random_.below(100);
        if (mailRoll < 20)
            mail = place(hebrew);
        QVariant mailStreet = mail.street;
        QVariant mailCity = mail.city;
        if (mailRoll >= 90) {
            mailStreet = null();
            if (mailRoll >= 95)
                mailCity = null();
        }
        QVariant billStreet = random_.chance(5) ? null() : bill.street;
        if (random_.chance(5) && !mailStreet.isNull())
            mailStreet = mailStreet.toString() + u"\r\n"_s + u"קומה 2"_s;

        QVariantList row = {code,
                            name,
                            random_.chance(50) ? QVariant(u"Foreign %1"_s.arg(i)) : null(),
                            type,
                            group,
                            mainContact,
                            billStreet,
                            bill.zip,
                            bill.city,
                            bill.county,
                            bill.country,
                            bill.state,
                            bill.block,
                            mailStreet,
                            mail.zip,
                            mailCity,
                            mail.county,
                            mail.country,
                            mail.state,
                            mail.block,
                            phone(10, u"04"_s),
                            phone(50, u"03"_s),
                            mobile(20),
                            phone(40, u"04"_s),
                            email(u"info%1"_s.arg(i), 15),
                            random_.pick(QList<int>{-1, 1, 2, 3, 5, 7}),
                            random_.digits(9),
                            random_.chance(70) ? null() : QVariant(u"הערה לכרטיס %1"_s.arg(i)),
                            null()};
        for (int n = 1; n <= 64; ++n)
            row << (random_.below(8) == 0 ? u"Y"_s : u"N"_s);
        add(u"OCRD"_s, row);

        for (int k = 0; k < contactCount; ++k)
            writeContact(code, contactCodes[k], contactNames[k], hebrew);
        writeAddressRows(code, bill, mail, billStreet);
        writeDocuments(code, name, type, contactCodes);
    }

    void writeContact(const QString& card, int contactCode, const QString& name, bool hebrew)
    {
        QVariant address = null();
        const int roll = random_.below(100);
        if (roll < 25) {
            const Place p = place(hebrew);
            address = p.street.toString() + u',' + p.city;
        } else if (roll < 30) {
            address = u"ת.ד 5"_s;
        }
        add(u"OCPR"_s,
            {contactCode, card, name, random_.chance(30) ? null() : QVariant(random_.pick(kPositions)), address,
             phone(20, u"04"_s), phone(70, u"04"_s), mobile(30), phone(60, u"04"_s),
             email(u"contact%1"_s.arg(contactCode), 30), phone(90, u"077"_s),
             random_.chance(30) ? null() : QVariant(random_.pick(kDepartments)),
             random_.chance(80) ? null() : QVariant(u"הערה"_s)});
    }

    void writeAddressRows(const QString& card, const Place& bill, const Place& mail, const QVariant& billStreet)
    {
        if (random_.chance(15))
            return;
        add(u"CRD1"_s,
            {card, u"כתובת ראשית"_s, u"B"_s, billStreet, bill.block, bill.city, bill.zip, bill.county, bill.state,
             bill.country});
        if (random_.chance(50))
            add(u"CRD1"_s,
                {card, u"משלוח"_s, u"S"_s, mail.street, mail.block, mail.city, mail.zip, mail.county, mail.state,
                 mail.country});
    }

    void writeDocuments(const QString& card, const QString& name, const QString& type, const QList<int>& contacts)
    {
        const int count = random_.below(6);
        for (int k = 0; k < count; ++k) {
            const DocumentType& document = kDocumentTypes[random_.below(static_cast<int>(kDocumentTypes.size()))];
            if (document.suppliersOnly != (type == u"S"_s) && random_.chance(80))
                continue;
            const QString table = QString::fromUtf16(document.table);
            const int entry = ++lastEntry_[table];
            const QDate date(2003 + random_.below(23), random_.below(12) + 1, random_.below(28) + 1);
            const QVariant contact = contacts.isEmpty() || random_.chance(20) ? QVariant(QMetaType::fromType<int>())
                                                                              : QVariant(random_.pick(contacts));
            add(table,
                {entry, 1000 + entry, card, name, date, contact,
                 random_.chance(20) ? null() : QVariant(u"כתובת מסמך %1"_s.arg(entry))});
            if (document.lines)
                writeLines(table == u"OINV"_s ? u"INV1"_s : u"RIN1"_s, entry);
        }
    }

    void writeLines(const QString& table, int entry)
    {
        const int count = random_.below(3) + 1;
        for (int line = 0; line < count; ++line) {
            const int item = random_.below(300) + 1;
            const QString code
                = item % 97 == 0 ? u"I'%1"_s.arg(item, 4, 10, QChar(u'0')) : u"I%1"_s.arg(item, 4, 10, QChar(u'0'));
            add(table, {entry, line, code});
        }
    }

    const CompanyOptions& options_;
    RowSink& sink_;
    Random random_;
    int lastContact_ = 0;
    QHash<QString, int> lastEntry_;
};

}  // namespace

void generateCompany(const CompanyOptions& options, RowSink& sink)
{
    Generator(options, sink).run();
}

}  // namespace pelmar

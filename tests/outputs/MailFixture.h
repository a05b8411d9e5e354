#pragma once

#include "options/OptionBindings.h"
#include "outputs/EmailCampaign.h"
#include "outputs/MailJournal.h"
#include "support/CompanyRows.h"
#include "support/Engines.h"
#include "support/OutputRun.h"
#include "support/SmtpSink.h"

#include <QDir>
#include <QRegularExpression>

namespace pelmar::test {

// Cards M01..M45, each with its own e-mail and a Hebrew name, and cards A1..A8 that each show
// one way a row can come: a contact's e-mail, no "@", no contact, no name, an address the server
// refuses, a name that tries to add a header, an address that tries to add a recipient, a contact
// without an e-mail.
inline QStringList mailCards()
{
    using namespace Qt::StringLiterals;
    const auto card = [](const QString& code, const QVariant& name, const QString& mail, const QString& contact = {}) {
        QVariantMap values{{u"CardCode"_s, code}, {u"CardName"_s, name}, {u"CardType"_s, u"C"_s}, {u"E_Mail"_s, mail}};
        if (!contact.isEmpty())
            values.insert(u"CntctPrsn"_s, contact);
        if (name.isNull())
            values.remove(u"CardName"_s);
        return insertRow(u"OCRD"_s, values);
    };
    QStringList rows;
    for (int n = 1; n <= 45; ++n) {
        const QString number = QString::number(n).rightJustified(2, u'0');
        rows << card(u"M"_s + number, u"לקוח "_s + number, u"m"_s + number + u"@example.test"_s);
    }
    rows << card(u"A1"_s, u"אלף"_s, u"card@a1.test"_s, u"דנה כהן"_s)
         << insertRow(u"OCPR"_s,
                      {{u"CntctCode"_s, 1},
                       {u"CardCode"_s, u"A1"_s},
                       {u"Name"_s, u"דנה כהן"_s},
                       {u"E_MailL"_s, u"dana@a1.test"_s}})
         << card(u"A2"_s, u"בית"_s, u"no-at.a2.test"_s) << card(u"A3"_s, u"כרטיס \"שלוש\""_s, u"plain@a3.test"_s)
         << card(u"A4"_s, QVariant(), u"noname@a4.test"_s) << card(u"A5"_s, u"חמש"_s, u"refuse@a5.test"_s)
         << card(u"A6"_s, u"Evil\r\nBcc: spy@evil.test"_s, u"hostile@a6.test"_s)
         << card(u"A7"_s, u"שבע"_s, u"x@a7.test>\r\nRCPT TO:<spy@evil.test"_s)
         << card(u"A8"_s, u"שמונה"_s, u"fallback@a8.test"_s, u"Contact Eight"_s)
         << insertRow(u"OCPR"_s,
                      {{u"CntctCode"_s, 2},
                       {u"CardCode"_s, u"A8"_s},
                       {u"Name"_s, u"Contact Eight"_s},
                       {u"E_MailL"_s, u""_s}});
    return rows;
}

// A header value with its RFC 2047 encoded words decoded (blanks between two words dropped).
inline QString decodedHeader(const QByteArray& value)
{
    static const QRegularExpression word(QStringLiteral("=\\?UTF-8\\?B\\?([A-Za-z0-9+/=]*)\\?="),
                                         QRegularExpression::CaseInsensitiveOption);
    const QString text = QString::fromLatin1(value);
    QByteArray decoded;
    qsizetype at = 0;
    for (auto matches = word.globalMatch(text); matches.hasNext();) {
        const auto match = matches.next();
        const QString between = text.mid(at, match.capturedStart() - at);
        if (at == 0 || !between.trimmed().isEmpty())
            decoded += between.toLatin1();
        decoded += QByteArray::fromBase64(match.captured(1).toLatin1());
        at = match.capturedEnd();
    }
    return QString::fromUtf8(decoded + text.mid(at).toLatin1());
}

// The e-mail run against the company above on the embedded engine and an SMTP sink of the
// test's own, with the options of an empty settings store made sendable: no body or attachment
// file, the cards M01..M45, the sink as the server.
class MailTest : public OutputRunTest {
protected:
    void SetUp() override
    {
        using namespace Qt::StringLiterals;
        OutputRunTest::SetUp();
        engine->createDatabase(u"mail"_s, handMadeCompany(900000, mailCards()));
        state.ConnServer = engine->server();
        state.ConnUID = engine->user();
        state.ConnDataBase = u"mail"_s;
        SetGetRegParams(2, *store, options);
        options.emailHtmlBody.clear();
        options.emailAttachFile.clear();
        options.emailFrom = u"shivuk@pelmar.test"_s;
        options.emailToMain = u"lakohot@pelmar.test"_s;
        options.smtpServer = u"127.0.0.1"_s;
        cards(u"M01"_s, u"M45"_s);
    }

    void cards(const QString& from, const QString& to)
    {
        options.codeRange = true;
        options.fromCard = from;
        options.toCard = to;
    }

    // Runs the campaign to the sink; returns the run's outcome.
    QString send(const SmtpSink& sink)
    {
        options.smtpPort = QString::number(sink.port());
        return runCampaign();
    }

    // Runs the campaign to the server of the options.
    QString runCampaign()
    {
        SmtpTransport transport(smtpServerOf(options));
        RunContext run = context();
        SendEmailCampaign(run, transport, journalFolder());
        return run.outcome;
    }

    QString journalFolder() const { return path(QStringLiteral("journal")); }

    // The lines of the one journal in the folder; empty when there is none.
    QStringList journal() const
    {
        const QStringList names = QDir(journalFolder()).entryList({QStringLiteral("*.journal")});
        if (names.isEmpty())
            return {};
        return QString::fromUtf8(readFile(QDir(journalFolder()).filePath(names.front())))
            .split(u'\n', Qt::SkipEmptyParts);
    }

    std::unique_ptr<Engine> engine = makeSqliteEngine();
};

}  // namespace pelmar::test

#pragma once

#include <QList>
#include <QString>

#include <array>

namespace pelmar {

// One entry of the sales employee list (CmbAgent).
struct SalesEmployee {
    QString name;  // OSLP.SlpName without leading and trailing blanks
    int code = 0;  // OSLP.SlpCode
    bool operator==(const SalesEmployee&) const = default;
};

// Every option of the control's five pages, one typed field each, with the value a page holds
// before anything is loaded. Which control and settings key stand for each field is said once,
// in the binding table (OptionBindings.h). List positions are -1 when nothing is chosen.
// The outputs read a copy taken when the run starts, so a run never sees a half-edited page.
struct MailingOptions {
    // Below the pages: the output the run button starts (cmbOutType).
    int outType = 0;

    // Criteria page: which cards the run reaches.
    bool catCode = false;  // ChkCatCode: card type and the chosen groups
    int cardType = 0;  // cmbCS: customers, suppliers, leads
    bool codeRange = false;
    QString fromCard;
    QString toCard;
    bool city = false;
    QString cityPrefix;
    bool phone = false;
    int phoneType = 0;  // cmbPhoneType: the phone column searched
    QString phonePrefix;
    bool agent = false;
    int agentIndex = -1;  // CmbAgent: a position in agents
    QList<SalesEmployee> agents;  // CmbAgent's entries, read from the database; never stored
    bool dates = false;  // the documents criterion
    QString fromDate = QStringLiteral("01/01/1980");
    QString toDate = QStringLiteral("01/01/2025");
    int docType = 0;  // CmbDocType
    int byDoc = 0;  // cmbByDoc: 0 cards that have such documents, 1 cards that have none
    QString fromDocNum;
    QString toDocNum;
    bool items = false;
    QString fromItem;
    QString toItem;
    bool properties = false;  // chkQryGroup: the properties chosen in the property picker
    bool sqlWhere = false;
    QString sqlWhereText;
    bool selectAccount = false;  // ChkSelectAccount: only the hand-picked cards
    int sortBy = 0;
    int sortDir = 0;  // 0 ascending, 1 descending

    // Label page: what a label holds and how the sheet is laid out.
    std::array<bool, 13> useTitle{};  // ChkTitle: which label lines are printed
    QString deptTag = QStringLiteral("0");  // LblDept's tag: "1" position, else department
    bool showAttn = true;  // the attention word before the contact
    bool deptNewLine = false;
    QString rows = QStringLiteral("8");  // layout boxes hold what the user typed;
    QString cols = QStringLiteral("3");  // a run reads them as numbers
    QString copies = QStringLiteral("1");
    QString startFrom = QStringLiteral("1");
    int labFormat = 0;  // cmbLabFormat: 0 standard, 1 contact above the company
    int addressFrom = 2;  // cmbAddressFrom: 0 mailing, 1 card, 2 document address
    bool allContacts = false;  // one item per contact person
    bool useContactAddress = false;  // prefer the contact's own address (with allContacts)
    bool addressBySql = false;
    QString sqlAddress;

    // Letters page.
    QString faxFile = QStringLiteral("c:\\mivtza1.doc");  // the Word template
    std::array<bool, 8> faxField{};  // which merge rows are filled
    std::array<QString, 8> faxExpr{};  // the free rows' SQL expressions (rows 4..7)
    int faxTransport = 1;  // OptOLE: 1 WinFax, 2 the fax service, 0 neither chosen
    QString faxSubject = QStringLiteral("מבצע השבוע");
    QString faxDelay = QStringLiteral("5");
    QString localAreaPrefix = QStringLiteral("04");

    // E-mail page.
    QString emailFrom = QStringLiteral("shivuk@pelmar.co.il");
    QString emailFromDesc = QStringLiteral("טרבל - מחלקת שיווק");
    QString emailSubject = QStringLiteral("מבצעי השבוע");
    QString emailContent = QStringLiteral("שלום רב. מצורף מידע על המבצעים החדשים");
    QString emailHtmlBody = QStringLiteral("c:\\nover.html");
    QString emailAttachFile = QStringLiteral("c:\\nover.doc");
    QString emailAttachFileDesc = QStringLiteral("פרטי המבצע");
    int emailMethod = 1;  // OptEmailMethod: 1 a message per recipient, 2 groups, 0 neither chosen
    QString emailGroupSize = QStringLiteral("20");
    QString emailToMain = QStringLiteral("lakohot@pelmar.co.il");
    QString emailToMainDesc = QStringLiteral("לקוחות טרבל");

    // E-mail page, the outgoing mail server.
    QString smtpServer = QStringLiteral("localhost");
    QString smtpPort = QStringLiteral("25");
    int smtpSecurity = 0;  // cmbSmtpSecurity: 0 STARTTLS when offered, 1 STARTTLS required, 2 TLS
    QString smtpUser;  // empty: no authentication
    QString smtpPassword;

    bool operator==(const MailingOptions&) const = default;
};

}  // namespace pelmar

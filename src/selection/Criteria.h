#pragma once

#include <QList>
#include <QString>

#include <optional>

namespace pelmar {

// A free merge field of the letters and faxes: an SQL expression returned under an alias.
struct MergeExpression {
    QString expression;
    QString alias;
};

// What the control's criteria and query options hold at the moment a statement is built.
// List indexes are -1 when nothing is chosen.
struct Criteria {
    bool catCode = false;
    int cardType = 0;  // cmbCS

    bool codeRange = false;
    QString fromCard;
    QString toCard;

    bool city = false;
    QString cityPrefix;

    bool phone = false;
    int phoneType = 0;
    QString phonePrefix;

    bool agent = false;
    std::optional<int> agentCode;  // item data of the chosen CmbAgent entry

    bool dates = false;
    QString fromDate;
    QString toDate;
    int docType = 0;  // CmbDocType
    int byDoc = 0;    // cmbByDoc: 0 have such documents, 1 have none
    QString fromDocNum;
    QString toDocNum;

    bool items = false;
    QString fromItem;
    QString toItem;

    bool properties = false;

    bool sqlWhere = false;
    QString sqlWhereText;

    // Query options of the select list and the order.
    int addressFrom = 2;  // 0 mailing address, 1 card address, 2 document address
    QString deptTag;      // LblDept's tag: "1" position, otherwise department
    bool addressBySql = false;
    QString sqlAddress;
    bool allContacts = false;
    QList<MergeExpression> mergeExpressions;
    int sortBy = 0;
    int sortDir = 0;

    // The document join: documents criterion on and not "cards without such documents".
    bool documentJoin() const { return dates && byDoc != 1; }
};

}  // namespace pelmar

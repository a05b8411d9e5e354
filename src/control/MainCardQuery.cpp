#include "common/SessionState.h"
#include "control/ClickableLabel.h"
#include "control/MainCard.h"
#include "control/Tag.h"
#include "selection/Criteria.h"
#include "selection/SelectBuilder.h"
#include "selection/SelectedCards.h"
#include "selection/WhereBuilder.h"

#include <QCheckBox>
#include <QComboBox>
#include <QLabel>
#include <QLineEdit>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

bool on(const QCheckBox* box)
{
    return box->isChecked();
}

}  // namespace

Criteria MainCard::criteria() const
{
    Criteria k;
    k.catCode = on(c_.ChkCatCode);
    k.cardType = c_.cmbCS->currentIndex();
    k.codeRange = on(c_.ChkAccKey);
    k.fromCard = c_.TxtFromCrd->text();
    k.toCard = c_.TxtToCrd->text();
    k.city = on(c_.ChkCity);
    k.cityPrefix = c_.TxtCity->text();
    k.phone = on(c_.ChkPhone);
    k.phoneType = c_.cmbPhoneType->currentIndex();
    k.phonePrefix = c_.txtPhone->text();
    k.agent = on(c_.ChkAgent);
    if (c_.CmbAgent->currentIndex() >= 0)
        k.agentCode = c_.CmbAgent->currentData().toInt();
    k.dates = on(c_.ChkDates);
    k.fromDate = c_.TxtFromDate->text();
    k.toDate = c_.TxtToDate->text();
    k.docType = c_.CmbDocType->currentIndex();
    k.byDoc = c_.cmbByDoc->currentIndex();
    k.fromDocNum = c_.txtFromDocNum->text();
    k.toDocNum = c_.txtToDocNum->text();
    k.items = on(c_.ChkItems);
    k.fromItem = c_.txtFromItem->text();
    k.toItem = c_.txtToItem->text();
    k.properties = on(c_.chkQryGroup);
    k.sqlWhere = on(c_.ChkUseSQLW);
    k.sqlWhereText = c_.txtSQLWhere->text();
    k.addressFrom = c_.cmbAddressFrom->currentIndex();
    k.deptTag = tagOf(c_.LblDept);
    k.addressBySql = on(c_.ChkAddressBySQL);
    k.sqlAddress = c_.txtSQLAddress->text();
    k.allContacts = on(c_.ChkAllContact);
    for (size_t i = 0; i < c_.chkFaxField.size(); ++i) {
        if (on(c_.chkFaxField[i]) && tagOf(c_.chkFaxField[i]) == u"5"_s)
            k.mergeExpressions.append({c_.txtFaxExpr[i]->text(), c_.LblFaxFormField[i]->text()});
    }
    k.sortBy = c_.CmbSortBy->currentIndex();
    k.sortDir = c_.CmbSortDir->currentIndex();
    return k;
}

QString MainCard::BuildWhere() const
{
    return pelmar::BuildWhere(criteria(), state_);
}

QString MainCard::BuildSelect(int pDocIndex, bool pAllDetails, short pOutType) const
{
    return pelmar::BuildSelect(criteria(), state_.SboVersionLevel, pDocIndex, pAllDetails, pOutType);
}

QString MainCard::BuildOrderBy(int pDocIndex, short pOutType) const
{
    return pelmar::BuildOrderBy(criteria(), state_.SboVersionLevel, pDocIndex, pOutType);
}

QString MainCard::BuildDatesCriteria(const QDate& pFromDate, const QDate& pToDate, int pDocIndex, int pDocRelation,
                                     const QString& pFromDocNum, const QString& pToDocNum) const
{
    return pelmar::BuildDatesCriteria(pFromDate, pToDate, pDocIndex, pDocRelation, pFromDocNum, pToDocNum);
}

QString MainCard::BuildItemsCriteria(const QString& pFromItem, const QString& pToItem) const
{
    return pelmar::BuildItemsCriteria(pFromItem, pToItem);
}

QString MainCard::BuildQryGroupCriteria() const
{
    return pelmar::BuildQryGroupCriteria(state_);
}

bool MainCard::IsSelectedCard(const QString& pCardCode) const
{
    return pelmar::IsSelectedCard(state_, pCardCode);
}

QString MainCard::recipientStatement(short pOutType, bool pAllDetails, bool ordered) const
{
    const int docIndex = c_.CmbDocType->currentIndex();
    QString statement = BuildSelect(docIndex, pAllDetails, pOutType) + BuildWhere();
    if (ordered)
        statement += BuildOrderBy(docIndex, pOutType);
    return statement;
}

bool MainCard::selectionFilter() const
{
    return selectionFilterOn(state_, c_.ChkSelectAccount->isChecked());
}

}  // namespace pelmar

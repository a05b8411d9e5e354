#include "settings/SettingsStore.h"
#include "common/Failure.h"
#include "control/MainCard.h"
#include "control/SetGetCtrl.h"
#include "control/Tag.h"

#include <QCheckBox>
#include <QComboBox>
#include <QLineEdit>
#include <QRadioButton>
#include "control/ClickableLabel.h"

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

const QString kFreeRowTag = u"5"_s;

}  // namespace

void MainCard::SetGetRegParams(unsigned char action)
{
    const auto key = [&](const QString& name, QObject* control, unsigned char prop, const QString& fallback) {
        try {
            SetGetCtrl(action, services_.settings, kPelmarApp, kParamsSection, name, control, prop, fallback);
        } catch (const Failure&) {
            // A key that cannot be written, read or assigned is skipped; the next one follows.
        }
    };
    key(u"OutType"_s, c_.cmbOutType, kPropListIndex, u"0"_s);
    key(u"UseCatCode"_s, c_.ChkCatCode, kPropValue, u"0"_s);
    key(u"CS"_s, c_.cmbCS, kPropListIndex, u"0"_s);
    key(u"UseAccKey"_s, c_.ChkAccKey, kPropValue, u"0"_s);
    key(u"FromCrd"_s, c_.TxtFromCrd, kPropText, {});
    key(u"ToCrd"_s, c_.TxtToCrd, kPropText, {});
    key(u"UseCity"_s, c_.ChkCity, kPropValue, u"0"_s);
    key(u"City"_s, c_.TxtCity, kPropText, {});
    key(u"UsePhone"_s, c_.ChkPhone, kPropValue, u"0"_s);
    key(u"Phone"_s, c_.txtPhone, kPropText, {});
    key(u"UseAgent"_s, c_.ChkAgent, kPropValue, u"0"_s);
    key(u"Agent"_s, c_.CmbAgent, kPropListIndex, u"0"_s);
    key(u"UseDates"_s, c_.ChkDates, kPropValue, u"0"_s);
    key(u"FromDate"_s, c_.TxtFromDate, kPropText, u"01/01/1980"_s);
    key(u"ToDate"_s, c_.TxtToDate, kPropText, u"01/01/2025"_s);
    key(u"DocType"_s, c_.CmbDocType, kPropListIndex, u"0"_s);
    key(u"UseSQLW"_s, c_.ChkUseSQLW, kPropValue, u"0"_s);
    key(u"SQLWhere"_s, c_.txtSQLWhere, kPropText, {});
    key(u"AddressBySQL"_s, c_.ChkAddressBySQL, kPropValue, u"0"_s);
    key(u"SQLAddress"_s, c_.txtSQLAddress, kPropText, {});
    key(u"Rows"_s, c_.txtRows, kPropText, u"8"_s);
    key(u"Cols"_s, c_.txtCols, kPropText, u"3"_s);
    key(u"Copies"_s, c_.txtCopies, kPropText, u"1"_s);
    key(u"SortBy"_s, c_.CmbSortBy, kPropListIndex, u"0"_s);
    key(u"SortDir"_s, c_.CmbSortDir, kPropListIndex, u"0"_s);
    key(u"ByDoc"_s, c_.cmbByDoc, kPropListIndex, u"0"_s);
    key(u"DeptField"_s, c_.LblDept, kPropTag, u"0"_s);
    key(u"ShowAttn"_s, c_.chkShowAttn, kPropValue, u"1"_s);
    for (int i = 0; i < static_cast<int>(c_.ChkTitle.size()); ++i)
        key(u"UseTitle"_s + QString::number(i), c_.ChkTitle[i], kPropValue, u"0"_s);
    key(u"DeptNewLine"_s, c_.chkDeptNewLine, kPropValue, u"0"_s);
    key(u"AllContact"_s, c_.ChkAllContact, kPropValue, u"0"_s);
    key(u"UseCntctAddrss"_s, c_.chkUseCntctAddrss, kPropValue, u"0"_s);
    key(u"AddressFrom"_s, c_.cmbAddressFrom, kPropListIndex, u"2"_s);
    key(u"PhoneType"_s, c_.cmbPhoneType, kPropListIndex, u"0"_s);
    key(u"LabFormat"_s, c_.cmbLabFormat, kPropListIndex, u"0"_s);
    key(u"FaxSubject"_s, c_.txtFaxSubject, kPropText, u"מבצע השבוע"_s);
    key(u"FaxDelay"_s, c_.txtFaxDelay, kPropText, u"5"_s);
    key(u"LocalAreaPrefix"_s, c_.TxtLocalAreaPrefix, kPropText, u"04"_s);
    key(u"OptOLE1"_s, c_.OptOLE[1], kPropValue, u"True"_s);
    key(u"OptOLE2"_s, c_.OptOLE[2], kPropValue, u"False"_s);
    key(u"FaxFile"_s, c_.txtFaxFile, kPropText, u"c:\\mivtza1.doc"_s);
    for (int i = 0; i < static_cast<int>(c_.chkFaxField.size()); ++i) {
        key(u"UseFaxField"_s + QString::number(i), c_.chkFaxField[i], kPropValue, u"0"_s);
        if (tagOf(c_.chkFaxField[i]) == kFreeRowTag)
            key(u"FaxExpr"_s + QString::number(i), c_.txtFaxExpr[i], kPropText, {});
    }
    key(u"EmailAttachFile"_s, c_.txtEmailAttachFile, kPropText, u"c:\\nover.doc"_s);
    key(u"EmailAttachFileDesc"_s, c_.txtEmailAttachFileDesc, kPropText, u"פרטי המבצע"_s);
    key(u"EmailFrom"_s, c_.txtEmailFrom, kPropText, u"shivuk@pelmar.co.il"_s);
    key(u"EmailFromDesc"_s, c_.txtEmailFromDesc, kPropText, u"טרבל - מחלקת שיווק"_s);
    key(u"EmailGroupSize"_s, c_.txtEmailGroupSize, kPropText, u"20"_s);
    key(u"EmailHTMLBody"_s, c_.txtEmailHTMLBody, kPropText, u"c:\\nover.html"_s);
    key(u"EmailSubject"_s, c_.txtEmailSubject, kPropText, u"מבצעי השבוע"_s);
    key(u"EmailToMain"_s, c_.txtEmailToMain, kPropText, u"lakohot@pelmar.co.il"_s);
    key(u"EmailToMainDesc"_s, c_.txtEmailToMainDesc, kPropText, u"לקוחות טרבל"_s);
    key(u"OptEmailMethod1"_s, c_.OptEmailMethod[1], kPropValue, u"True"_s);
    key(u"OptEmailMethod2"_s, c_.OptEmailMethod[2], kPropValue, u"False"_s);
}

}  // namespace pelmar

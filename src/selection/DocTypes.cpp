#include "selection/DocTypes.h"

using namespace Qt::StringLiterals;

namespace pelmar {

DocTypeInfo GetDocTypeInfo(int pDocIndex)
{
    const QString card = u"CardCode"_s;
    const QString name = u"CardName"_s;
    const QString docDate = u"DocDate"_s;
    switch (pDocIndex) {
    case 1: return {u"ORIN"_s, card, name, docDate, true};
    case 2: return {u"ODLN"_s, card, name, docDate, true};
    case 3: return {u"OPOR"_s, card, name, docDate, true};
    case 4: return {u"OQUT"_s, card, name, docDate, true};
    case 5: return {u"ORCT"_s, card, name, docDate, true};
    case 6: return {u"OCHO"_s, u"VendorCode"_s, u"VendorName"_s, u"PmntDate"_s, false};
    case 7: return {u"OVPM"_s, card, name, docDate, true};
    case 8: return {u"OCRV"_s, card, name, u"PayDate"_s, false};
    default: return {u"OINV"_s, card, name, docDate, true};
    }
}

QString CardTypeCode(int index, bool forGroups)
{
    switch (index) {
    case 0: return u"C"_s;
    case 1: return u"S"_s;
    case 2: return forGroups ? u"C"_s : u"L"_s;
    default: return u"All"_s;
    }
}

}  // namespace pelmar

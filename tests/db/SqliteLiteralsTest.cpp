#include "db/SqliteLiterals.h"
#include "support/QtPrinting.h"

#include <gtest/gtest.h>

using namespace Qt::StringLiterals;

namespace pelmar::test {
namespace {

TEST(SqliteLiterals, NationalTextAndUsDatesAreRewrittenAndNothingElse)
{
    const std::pair<QString, QString> cases[] = {
        {u"WHERE a LIKE N'חי%' AND b BETWEEN N'C1' And N'C9'"_s, u"WHERE a LIKE 'חי%' AND b BETWEEN 'C1' And 'C9'"_s},
        {u"D Between '03/01/2005' And '03/31/2005'"_s, u"D Between '2005-03-01' And '2005-03-31'"_s},
        {u"x = N'it''s N''x'''"_s, u"x = 'it''s N''x'''"_s},
        {u"CARDN'"_s, u"CARDN'"_s},
        {u"x = '3/1/2005' OR y = '03/01/2005 '"_s, u"x = '3/1/2005' OR y = '03/01/2005 '"_s},
        {u"\"N'a'\" = [N'b']"_s, u"\"N'a'\" = [N'b']"_s},
        {u"n'lower'"_s, u"'lower'"_s},
        {u"x = 'a''03/01/2005'"_s, u"x = 'a''03/01/2005'"_s},
        {u"x = '03/01/2005''' OR '12/31/1999'"_s, u"x = '03/01/2005''' OR '1999-12-31'"_s},
        {u"[a]]N'b] = N'c'"_s, u"[a]]N'b] = 'c'"_s},
    };
    for (const auto& [sql, expected] : cases)
        EXPECT_EQ(adaptLiteralsForSqlite(sql), expected) << sql.toStdString();
}

}  // namespace
}  // namespace pelmar::test

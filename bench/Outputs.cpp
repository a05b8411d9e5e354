#include "bench/Outputs.h"

#include "common/SessionState.h"
#include "outputs/LabelSheet.h"
#include "outputs/RecipientList.h"
#include "outputs/SmsList.h"
#include "selection/Criteria.h"
#include "selection/SelectBuilder.h"
#include "selection/WhereBuilder.h"

using namespace Qt::StringLiterals;

namespace pelmar::bench {

namespace {

// The criteria of a plain run over every card: mailing address, sorted by card code.
Criteria everyCard()
{
    Criteria criteria;
    criteria.addressFrom = 0;
    return criteria;
}

QString statement(short kind, bool details, bool ordered)
{
    const Criteria criteria = everyCard();
    QString text = BuildSelect(criteria, 1, 0, details, kind) + BuildWhere(criteria, SessionState{});
    if (ordered)
        text += BuildOrderBy(criteria, 1, 0, kind);
    return text;
}

QStringList labelStatements()
{
    return {statement(kCardList, true, false), statement(kLabels, true, true)};
}

void runLabels(const DatabaseClient& client, const QString& connString, const QString& path)
{
    LabelPage page;
    page.rows = u"8"_s;
    page.cols = u"3"_s;
    page.start = u"1"_s;
    page.copies = u"1"_s;
    page.enabled.fill(true);
    LabelDefTable styles{};
    const QStringList statements = labelStatements();
    writeLabelSheet(path, page, styles, LabelQueries{client, connString, statements[0], statements[1], {}});
}

QStringList listStatements()
{
    return {statement(kLabels, true, true)};
}

void runList(const DatabaseClient& client, const QString& connString, const QString& path)
{
    writeRecipientList(path, kLabels, ListQuery{client, connString, listStatements()[0], {}}, ListPageLayout{8, 3, 1},
                       QDate::currentDate());
}

QStringList smsStatements()
{
    return {statement(kMobiles, true, true)};
}

void runSms(const DatabaseClient& client, const QString& connString, const QString& path)
{
    writeSmsList(path, ListQuery{client, connString, smsStatements()[0], {}});
}

}  // namespace

const QList<BenchOutput>& benchOutputs()
{
    static const QList<BenchOutput> outputs = {{u"labels"_s, &labelStatements, &runLabels},
                                               {u"list"_s, &listStatements, &runList},
                                               {u"sms"_s, &smsStatements, &runSms}};
    return outputs;
}

const BenchOutput* benchOutput(const QString& name)
{
    for (const BenchOutput& output : benchOutputs()) {
        if (output.name == name)
            return &output;
    }
    return nullptr;
}

}  // namespace pelmar::bench

#include "bench/Picker.h"

#include "db/ConnString.h"
#include "db/DatabaseClient.h"
#include "demo/SqliteCompanyWriter.h"
#include "selection/CheckListModel.h"
#include "selection/PickerData.h"

#include <QDir>
#include <QElapsedTimer>
#include <QTemporaryDir>
#include <QTextStream>

using namespace Qt::StringLiterals;

namespace pelmar::bench {

namespace {

double seconds(const std::function<void()>& work)
{
    QElapsedTimer timer;
    timer.start();
    work();
    return timer.nsecsElapsed() / 1e9;
}

}  // namespace

int measurePicker(int cards)
{
    QTemporaryDir folder;
    CompanyOptions options;
    options.cards = cards;
    options.seed = 42;
    writeSqliteCompany(QDir(folder.path()).filePath(u"bench.sqlite"_s), options);
    const DatabaseClient client{QString()};
    const QString connString = BuildConnString(u"sqlite:"_s + folder.path(), u"bench"_s, {}, u"bench"_s);

    CheckListModel model({u"code"_s, u"check"_s, u"name"_s}, {0, CheckListModel::kCheckColumn, 1});
    QTextStream out(stdout);
    const double fill = seconds([&] {
        readCardList(client, connString,
                     u"SELECT DISTINCT OCRD.CardCode, OCRD.CardName FROM OCRD ORDER BY OCRD.CardCode"_s,
                     [&](const QVector<CheckListModel::Row>& rows) { model.appendRows(rows); });
    });
    for (int i = 0; i < model.rowCount(); i += 7)
        model.setChecked(i, true);
    const double byName = seconds([&] { model.sortByText(1); });
    const double byMark = seconds([&] { model.sortByCheckThenText(1); });
    const double search = seconds([&] { model.findPrefix(1, u"no such name"_s); });
    out << u"card picker, %1 rows: fill %2 s, sort by name %3 s, sort by mark %4 s, search %5 s"_s.arg(model.rowCount())
               .arg(fill, 0, 'f', 3)
               .arg(byName, 0, 'f', 3)
               .arg(byMark, 0, 'f', 3)
               .arg(search, 0, 'f', 3)
        << Qt::endl;
    return 0;
}

}  // namespace pelmar::bench

#include "outputs/LabelSheet.h"

#include "common/Failure.h"
#include "common/Fields.h"
#include "common/TextFileWriter.h"
#include "db/DatabaseClient.h"
#include "options/MailingOptions.h"
#include "outputs/LabelComposer.h"
#include "outputs/RunParameters.h"

#include <cmath>

using namespace Qt::StringLiterals;

namespace pelmar {

namespace {

constexpr int kMaxShort = 32767;

void writeHead(TextFileWriter& file, const LabelLayout& layout, const MailingOptions& options,
               const LabelDefTable& styles)
{
    file.line(u"<HTML>"_s);
    file.line(u"<HEAD>"_s);
    file.line(u"<TITLE>טרבל מערכות מידע מציגה</TITLE>"_s);
    file.line(u"<meta http-equiv='Content-Type' content='text/html; charset=windows-1255'>"_s);
    file.line(u"<style>"_s);
    file.line(u" TR {vertical-align: middle; text-align: right}"_s);
    file.line(u" TD {vertical-align: middle}"_s);
    file.line(u" .TDL {; height: "_s + cellSizeText(layout.rows) + u"%; width: "_s + cellSizeText(layout.cols)
              + u"%; vertical-align: middle; text-align: center}"_s);
    file.line(u" .TBL1 {padding: 1; border-spacing: 0; border-collapse: collapse; border: none; direction: rtl}"_s);
    for (int line = 0; line < 13; ++line) {
        if (options.useTitle[line]) {
            for (const QString& rule : labelStyleRules(line, styles[line]))
                file.line(rule);
        }
    }
    file.line(u"</style>"_s);
    file.line(u"</HEAD>"_s);
    file.line(u"<BODY BGCOLOR='#FFFFFF'>"_s);
}

bool passes(const LabelQueries& queries, const Recordset& row)
{
    return !queries.wanted || queries.wanted(FieldText(row.value(u"CardCode"_s)));
}

qint64 countRecipients(Recordset& rows, const LabelQueries& queries)
{
    qint64 count = 0;
    for (; !rows.eof(); rows.moveNext()) {
        if (passes(queries, rows))
            ++count;
    }
    return count;
}

// The labels, page by page and cell by cell; each recipient takes copies consecutive cells.
class CellWriter {
public:
    CellWriter(TextFileWriter& file, const LabelLayout& layout, const LabelQueries& queries,
               const LabelComposer& composer, Recordset& rows)
        : file_(file), layout_(layout), queries_(queries), composer_(composer), rows_(rows)
    {}

    void page(qint64 number)
    {
        file_.bytes("<table height='100%' width='100%' border='0' cellpadding='0' cellspacing='0' dir='rtl'>\r\n");
        for (int r = 1; r <= layout_.rows; ++r) {
            file_.bytes("  <tr>\r\n");
            for (int c = 1; c <= layout_.cols; ++c)
                cell(number == 1 && (r - 1) * layout_.cols + c < layout_.start);
            file_.bytes("  </tr>\r\n");
        }
        file_.bytes("</table>\r\n");
    }

private:
    void cell(bool beforeStart)
    {
        file_.bytes("    <td class=TDL>\r\n     <table class=TBL1>\r\n");
        while (queries_.wanted && !rows_.eof() && !passes(queries_, rows_))
            rows_.moveNext();
        if (beforeStart || rows_.eof()) {
            file_.bytes("    <tr><td>&nbsp;</td></tr>\r\n");
        } else {
            composer_.write(file_);
            if (++copy_ == layout_.copies) {
                copy_ = 0;
                rows_.moveNext();
            }
        }
        file_.bytes("     </table>\r\n    </td>\r\n");
    }

    TextFileWriter& file_;
    const LabelLayout& layout_;
    const LabelQueries& queries_;
    const LabelComposer& composer_;
    Recordset& rows_;
    int copy_ = 0;
};

}  // namespace

std::pair<int, int> readLabelPage(const MailingOptions& options)
{
    const int cols = wholeNumberIn(options.cols, u"עמודות"_s, 1, kMaxShort);
    const int rows = wholeNumberIn(options.rows, u"שורות"_s, 1, kMaxShort);
    if (rows * cols > kMaxShort)
        throw Failure(
            u"דף של %1 שורות ו-%2 עמודות גדול מדי: מותרות עד %3 מדבקות בדף."_s.arg(rows).arg(cols).arg(kMaxShort), 6);
    return {rows, cols};
}

LabelLayout LabelLayout::read(const MailingOptions& options)
{
    LabelLayout layout{};
    std::tie(layout.rows, layout.cols) = readLabelPage(options);
    layout.start = wholeNumberIn(options.startFrom, u"התחל ממדבקה"_s, -kMaxShort - 1, kMaxShort);
    layout.copies = wholeNumberIn(options.copies, u"עותקים"_s, 0, 255);
    return layout;
}

QString cellSizeText(int cells)
{
    const long tenths = std::lround(1000.0 / cells);
    return u"%1.%2"_s.arg(tenths / 10, 2, 10, QChar(u'0')).arg(tenths % 10);
}

void writeLabelSheet(const QString& path, const MailingOptions& options, const LabelDefTable& styles,
                     const LabelQueries& queries)
{
    const LabelLayout layout = LabelLayout::read(options);
    TextFileWriter file(path, true);
    writeHead(file, layout, options, styles);

    auto counting = queries.client.open(queries.counting, queries.connString);
    if (counting->eof())
        return file.close();
    const qint64 count = countRecipients(*counting, queries);
    counting->close();

    const qint64 positions = qint64(layout.copies) * (layout.start + count - 1);
    const qint64 pages = positions / layout.perPage() + (positions % layout.perPage() != 0 ? 1 : 0);

    auto rows = queries.client.open(queries.labels, queries.connString);
    if (rows->eof())
        return file.close();
    const LabelComposer composer(options, styles, *rows);
    CellWriter cells(file, layout, queries, composer, *rows);
    for (qint64 number = 1; number <= pages; ++number)
        cells.page(number);
    file.line(u"</BODY>"_s);
    file.line(u"</HTML>"_s);
    file.close();
}

}  // namespace pelmar

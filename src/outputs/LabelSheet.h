#pragma once

#include "outputs/LabelStyles.h"

#include <QString>

#include <functional>
#include <utility>

namespace pelmar {

class DatabaseClient;
struct MailingOptions;

// The label page's layout boxes read into numbers. Throws Failure naming the box that holds no valid number:
// rows and columns 1..32767 with rows × columns at most 32767, start -32768..32767, copies
// 0..255.
struct LabelLayout {
    int rows;
    int cols;
    int start;
    int copies;

    static LabelLayout read(const MailingOptions& options);
    int perPage() const { return rows * cols; }
};

// The rows and columns of a label page as the layout boxes give them; throws Failure naming the
// box that holds no number in range, or saying that the page would hold more than 32767 labels.
// The label sheet and the labels list read the page the same way.
std::pair<int, int> readLabelPage(const MailingOptions& options);

// The two statements of a label run and where they are read.
struct LabelQueries {
    const DatabaseClient& client;
    QString connString;
    QString counting;  // kind 1 with details, no order
    QString labels;  // kind 2 with details and the order
    // The selection filter: null when off, else true for the codes the list holds.
    std::function<bool(const QString&)> wanted;
};

// "; height: 33.3%" style cell size of n cells across the page: 100 ÷ n, at least two integer
// digits and one decimal rounded half away from zero, a point as separator.
QString cellSizeText(int cells);

// Writes the label sheet to path: the head with the style rules of the enabled lines, then one
// table per page with rows × cols cells, each recipient filling copies consecutive cells from
// the start position on, each label composed line by line. Two forward passes over the
// recipients (count, then labels); nothing but the current row is held. When either statement
// returns no row the file ends after its head. Values from the database and fixed texts are
// HTML-escaped; the markup the sheet adds itself is not.
// Throws Failure on a database or file failure; the file then holds what was written.
void writeLabelSheet(const QString& path, const MailingOptions& options, const LabelDefTable& styles,
                     const LabelQueries& queries);

}  // namespace pelmar

#include "designer/run/ResultModel.h"

#include "frontends/qt/ShownText.h"

#include <QApplication>
#include <QFont>
#include <QLocale>
#include <QPalette>

#include <algorithm>
#include <limits>
#include <map>
#include <set>

namespace zandor::designer {

using platform::qt::asSigns;
using platform::qt::asToolTip;

namespace {

constexpr qint64 mostBytesOfACell = 4000; // more than anybody reads in a table
constexpr qsizetype memoryInOrder = 1 << 20;
constexpr qsizetype memorySorted = 16 << 20; // each row on the screen is of another page
constexpr qint64 mostCellsCopied = 500'000;
constexpr qsizetype mostShown = 300; // characters of a cell; what is wider is cut off anyway

qsizetype memoryOf(const std::vector<Row>& page) {
    constexpr qsizetype header = 32; // of a text, and what an allocation rounds up to
    qsizetype bytes = 0;
    for (const Row& row : page)
        for (const Cell& cell : row) bytes += sizeof(Cell) + header + 2 * cell.text.size();
    return bytes;
}

QString readable(const Cell& cell, const CellFormat& format) {
    if (cell.kind != Cell::Kind::blob) return shown(cell, format);
    return ResultModel::tr("(blob, %1 bytes)").arg(QLocale().toString(cell.text.toLongLong()));
}

/// As spreadsheets take it: quotes around what would break the table.
void appendCopied(QString& text, const Cell& cell, const CellFormat& format) {
    QString value = readable(cell, format);
    const bool breaks = value.contains(u'\t') || value.contains(u'\n') || value.contains(u'\r');
    text += breaks ? u'"' + value.replace(u'"', QStringLiteral("\"\"")) + u'"' : value;
}

} // namespace

void ResultModel::setSpool(const std::shared_ptr<Spool>& spool) {
    beginResetModel();
    mSpool = spool;
    mColumns.clear();
    mOrder.clear();
    mRows = 0;
    mPages.clear();
    mPages.setMaxCost(memoryInOrder);
    endResetModel();
}

void ResultModel::refresh() {
    if (!mSpool) return;
    if (const QStringList columns = mSpool->columns(); columns != mColumns) {
        beginResetModel();
        mColumns = columns;
        endResetModel();
    }
    const qint64 present = std::min<qint64>(mSpool->rows(), std::numeric_limits<int>::max());
    if (present <= mRows) return;
    mPages.remove(mRows / Spool::rowsInAPage); // it has more rows now
    beginInsertRows({}, mRows, static_cast<int>(present) - 1);
    mRows = static_cast<int>(present);
    endInsertRows();
}

bool ResultModel::setFormats(const ColumnFormats& formats) {
    if (formats == mFormats) return false;
    mFormats = formats;
    if (mRows > 0) emit dataChanged(index(0, 0), index(mRows - 1, columnCount() - 1));
    return true;
}

void ResultModel::setOrder(RowOrder order) {
    mOrder = std::move(order);
    mPages.setMaxCost(mOrder.empty() ? memoryInOrder : memorySorted);
    if (mRows > 0) emit dataChanged(index(0, 0), index(mRows - 1, columnCount() - 1));
}

qint64 ResultModel::spooled(int row) const {
    const auto place = static_cast<std::size_t>(row);
    return place < mOrder.size() ? mOrder[place] : row;
}

int ResultModel::rowCount(const QModelIndex& parent) const { return parent.isValid() ? 0 : mRows; }

int ResultModel::columnCount(const QModelIndex& parent) const {
    return parent.isValid() ? 0 : static_cast<int>(mColumns.size());
}

QVariant ResultModel::data(const QModelIndex& index, int role) const {
    switch (role) {
    case Qt::DisplayRole: {
        const Cell value = cell(index);
        if (value.kind == Cell::Kind::null) return QStringLiteral("NULL");
        return asSigns(readable(value, format(index.column())).left(mostShown).simplified());
    }
    case Qt::ToolTipRole: return asToolTip(readable(cell(index), format(index.column())));
    case Qt::TextAlignmentRole: {
        const bool number = cell(index).kind == Cell::Kind::number;
        return QVariant(Qt::AlignVCenter | (number ? Qt::AlignRight : Qt::AlignLeft));
    }
    case Qt::ForegroundRole:
        if (const auto kind = cell(index).kind;
            kind == Cell::Kind::null || kind == Cell::Kind::blob)
            return QApplication::palette().brush(QPalette::PlaceholderText);
        return {};
    default: return {};
    }
}

QVariant ResultModel::headerData(int section, Qt::Orientation orientation, int role) const {
    if (orientation == Qt::Vertical)
        return role == Qt::DisplayRole ? QVariant(QLocale().toString(section + 1)) : QVariant();
    if (role == Qt::DisplayRole) return asSigns(mColumns.value(section)).left(mostShown);
    if (role == Qt::ToolTipRole)
        return asToolTip(tr("%1\nClick to sort the rows that are shown; the query stays as it is.")
                             .arg(asSigns(mColumns.value(section))));
    return {};
}

Cell ResultModel::cell(const QModelIndex& index) const {
    if (!mSpool || !index.isValid()) return {};
    const qint64 place = spooled(index.row());
    const qint64 number = place / Spool::rowsInAPage;
    const std::vector<Row>* page = mPages.object(number);
    if (!page) {
        auto read = std::make_unique<std::vector<Row>>(mSpool->page(number, mostBytesOfACell));
        page = read.get();
        const qsizetype cost = memoryOf(*page);
        // Where one ends, rows of two are on the screen.
        mPages.setMaxCost(std::max(mPages.maxCost(), 2 * cost));
        mPages.insert(number, read.release(), cost);
    }
    const auto row = static_cast<std::size_t>(place % Spool::rowsInAPage);
    if (row >= page->size()) return {};
    return (*page)[row][static_cast<std::size_t>(index.column())];
}

std::optional<QString> ResultModel::copied(const QItemSelection& selection) const {
    qint64 cells = 0;
    std::set<int> columns;
    std::map<int, int> rows; // the last one of a run by the first one
    for (const QItemSelectionRange& range : selection) {
        cells += qint64(range.width()) * range.height();
        for (int column = range.left(); column <= range.right(); ++column) columns.insert(column);
        int& last = rows[range.top()];
        last = std::max(last, range.bottom());
    }
    if (cells > mostCellsCopied) return {};

    // In the order of the spool, so that each page of it is read once.
    std::vector<std::pair<qint64, int>> places;
    int next = 0;
    for (const auto& [first, last] : rows) {
        for (int row = std::max(first, next); row <= last; ++row)
            places.emplace_back(spooled(row), row);
        next = std::max(next, last + 1);
    }
    std::sort(places.begin(), places.end());
    std::map<int, QString> lines;
    std::vector<Row> page;
    qint64 pageNumber = -1;
    for (const auto& [spooledRow, row] : places) {
        if (const qint64 number = spooledRow / Spool::rowsInAPage; number != pageNumber) {
            page = mSpool->page(number, std::numeric_limits<qint64>::max());
            pageNumber = number;
        }
        const auto place = static_cast<std::size_t>(spooledRow % Spool::rowsInAPage);
        QString& line = lines[row];
        for (const int column : columns) {
            if (column != *columns.begin()) line += u'\t';
            if (place < page.size() && selection.contains(index(row, column)))
                appendCopied(line, page[place][static_cast<std::size_t>(column)], format(column));
        }
    }
    QStringList text;
    for (const auto& [row, line] : lines) text << line;
    return text.join(u'\n');
}

} // namespace zandor::designer

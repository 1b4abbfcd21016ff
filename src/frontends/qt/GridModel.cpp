#include "frontends/qt/GridModel.h"

#include "frontends/qt/ShownText.h"

#include <Zandor/qt/Text.h>

#include <algorithm>
#include <array>

namespace zandor::platform::qt {

GridModel::GridModel(int rows, int cols, QObject* parent)
    : QAbstractTableModel(parent), mRows(rows), mColumns(static_cast<std::size_t>(cols)) {
    setWords({});
}

const GridModel::Cell& GridModel::cell(int row, int col) const {
    static const Cell blank;
    const auto& cells = column(col).cells;
    return cells.empty() ? blank : cells[static_cast<std::size_t>(row)];
}

GridModel::Cell& GridModel::writable(int row, int col) {
    auto& cells = column(col).cells;
    cells.resize(static_cast<std::size_t>(mRows));
    return cells[static_cast<std::size_t>(row)];
}

void GridModel::setText(int row, int col, const QString& text) {
    if (text != cell(row, col).text) writable(row, col).text = text;
}

void GridModel::setNote(int row, int col, const QString& note) {
    if (note != cell(row, col).note) writable(row, col).note = note;
}

void GridModel::setAlignment(int row, int col, std::int16_t alignment) {
    // 0 to 8 run down the left, the middle and the right; 9 leaves it to the kind of the text.
    static constexpr std::array<Qt::AlignmentFlag, 3> across = {Qt::AlignLeft, Qt::AlignHCenter,
                                                                Qt::AlignRight};
    static constexpr std::array<Qt::AlignmentFlag, 3> down = {Qt::AlignTop, Qt::AlignVCenter,
                                                              Qt::AlignBottom};
    const auto place = static_cast<std::size_t>(alignment > 8 ? 1 : alignment);
    writable(row, col).alignment = across[place / 3] | down[place % 3];
}

void GridModel::setWords(const Words& words) {
    mAscending = toQt(words.Ascending);
    mDescending = toQt(words.Descending);
    mWords = words;
}

void GridModel::move(int from, int to) {
    const auto at = [this](int col) { return mColumns.begin() + col; };
    if (from < to)
        std::rotate(at(from), at(from + 1), at(to + 1));
    else
        std::rotate(at(to), at(from), at(from + 1));
}

void GridModel::announce() {
    Q_EMIT dataChanged(index(0, 0), index(rowCount() - 1, columnCount() - 1));
    Q_EMIT headerDataChanged(Qt::Horizontal, 0, columnCount() - 1);
    Q_EMIT headerDataChanged(Qt::Vertical, 0, rowCount() - 1);
}

int GridModel::rowCount(const QModelIndex& parent) const {
    return parent.isValid() ? 0 : mRows - 1;
}

int GridModel::columnCount(const QModelIndex& parent) const {
    return parent.isValid() ? 0 : cols() - 1;
}

QVariant GridModel::valueOf(const Cell& cell, int role) {
    if (role == Qt::DisplayRole) return asSigns(cell.text);
    if (role == Qt::TextAlignmentRole) return static_cast<int>(cell.alignment);
    if (role == noteRole) return cell.note;
    if (role == Qt::AccessibleDescriptionRole && !cell.note.isEmpty()) return cell.note;
    return {};
}

comforts::CellText GridModel::reader() const {
    return [this](std::int32_t row, std::int32_t col) { return fromQt(text(row, col)); };
}

QString GridModel::titleOf(int row, int col) const {
    return asSigns(toQt(comforts::titleOfCell(mWords, reader(), row, col)));
}

QVariant GridModel::arrow(int row, int col) const {
    constexpr int sortRow = 2;
    if (row != sortRow) return {};
    if (text(row, col) == mAscending) return QStringLiteral("▲");
    if (text(row, col) == mDescending) return QStringLiteral("▼");
    return {};
}

QVariant GridModel::data(const QModelIndex& index, int role) const {
    if (!index.isValid()) return {};
    if (role == Qt::AccessibleTextRole) {
        return asSigns(
            toQt(comforts::nameOfCell(mWords, reader(), index.row() + 1, index.column() + 1)));
    }
    if (role == arrowRole) return arrow(index.row() + 1, index.column() + 1);
    return valueOf(cell(index.row() + 1, index.column() + 1), role);
}

QVariant GridModel::headerData(int section, Qt::Orientation orientation, int role) const {
    if (section < 0) return {};
    if (orientation == Qt::Horizontal)
        return section < columnCount() ? valueOf(cell(0, section + 1), role) : QVariant();
    return section < rowCount() ? valueOf(cell(section + 1, 0), role) : QVariant();
}

} // namespace zandor::platform::qt

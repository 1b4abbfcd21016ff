#pragma once

#include "designer/run/NativeResult.h"

#include <QByteArray>
#include <QStringList>

#include <vector>

namespace zandor::designer {

/// A value of a result as text, in a form that does not depend on the user's language.
struct Cell {
    enum class Kind : quint8 { null, text, number, boolean, blob };

    Kind kind = Kind::null;
    QString text = {}; ///< "true" and "false" of a boolean; empty for a blob
    QByteArray blob = {};

    friend bool operator==(const Cell&, const Cell&) = default;
};

using Row = std::vector<Cell>;

/// Reads the values of a statement's row.
class CellReader {
public:
    /// For a statement of the database that has been sent. `query` outlives the reader.
    CellReader(const QSqlQuery& query, const QSqlDatabase& database);

    QStringList columns() const { return mColumns; }
    /// The row that the statement stands on; the same object each time.
    const Row& row();

private:
    Cell cell(int column) const;

    const QSqlQuery& mQuery;
    const NativeResult mNative;
    const int mDigits; ///< of a fraction
    QStringList mColumns;
    std::vector<bool> mNumbers; ///< whose values are numbers even where they come as text
    std::vector<bool> mMoments;
    Row mRow;
};

} // namespace zandor::designer

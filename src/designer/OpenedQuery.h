#pragma once

#include <Zandor/DatabaseReader.h>
#include <Zandor/Query.h>

#include <QStringList>

namespace zandor::designer {

/// The canvas has room for so many; the control leaves out what is beyond.
inline constexpr std::int32_t mostTables = 16;
inline constexpr std::int32_t mostJoins = 64;
/// And the grid for so many output columns.
inline constexpr std::int32_t mostOutputColumns = 255;

/// A query over a database, ready to be shown.
struct OpenedQuery {
    platform::Ref<model::Query> query;
    QString message; ///< which joins were left out, or empty
};

/// Which tables a new query begins with.
struct FirstTables {
    QStringList names = {}; ///< empty: none, for nobody has asked for any
    bool example = false;   ///< those of the example with its output columns, when no name is given
    QString database = {};  ///< how messages call it
    std::int32_t canvasWidth = 18000; ///< twips
};

/// A query of the tables that are wanted, with the joins between them. `present` are the
/// database's.
reader::Result<OpenedQuery> openQuery(reader::DatabaseReader& schema,
                                      const std::vector<reader::TableEntry>& present,
                                      const FirstTables& wanted);

} // namespace zandor::designer

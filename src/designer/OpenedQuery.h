#pragma once

#include "designer/Arguments.h"
#include "model/Query.h"

namespace designer {

/// The canvas has room for so many; the control leaves out what is beyond.
inline constexpr std::int32_t mostTables = 16;
inline constexpr std::int32_t mostJoins = 64;

/// A query over a database that was read, ready to be shown.
struct OpenedQuery {
    platform::Ref<model::Query> query;
    QString name;    ///< of the database, for the window's title
    QString message; ///< what is in the query, and what was left out
};

/// Reads the tables named, or chooses some: of the sample database those of the example, of
/// another the first ones. `sample` is the file that an empty one stands for; `canvasWidth` is in
/// twips.
reader::Result<OpenedQuery> openQuery(const Arguments& arguments, const QString& sample,
                                      std::int32_t canvasWidth);

} // namespace designer

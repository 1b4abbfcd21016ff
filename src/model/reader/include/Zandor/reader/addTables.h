#pragma once

#include <Zandor/DatabaseReader.h>
#include <Zandor/Query.h>
#include <Zandor/reader/export.h>

namespace zandor::reader {

/// A foreign key that was not drawn, because another one joins the same tables.
struct LeftOut {
    ForeignKey drawn; ///< the one that joins them
    ForeignKey other; ///< the one that was left out
};

/// Puts tables with their columns into a query, then a join for every pair of columns of the
/// foreign keys that connect one of them with another or with a table that stands there already
/// (left the child, right the parent, "="). A table named twice gets in twice. Everything is read
/// before the query is touched, so on an error the query is as it was.
///
/// Of tables that stand in the query several times, the first one is joined. Where it has several
/// keys to another table that does, each leads to an instance of its own, the one with the smallest
/// name to the first; those that are drawn already stay. A key from a table to itself joins the
/// first to the second, and is left out when there is one only.
///
/// Two keys between one pair of tables, in whatever direction, mostly mean two different things
/// (who is billed, who is delivered to), and both joins at once find next to nothing. So the one
/// with the smaller name is drawn, the name being that of the key's first column, and the others
/// are put into `leftOut`, if there is one.
///
/// The tables are placed and sized for a canvas of `canvasWidth` twips, clear of the tables that
/// have a place.
ZANDOR_READER_EXPORT Result<std::vector<platform::Ref<model::Table>>>
addTables(model::Query& query, DatabaseReader& reader, const std::vector<TableId>& names,
          std::int32_t canvasWidth, std::vector<LeftOut>* leftOut = nullptr);

} // namespace zandor::reader

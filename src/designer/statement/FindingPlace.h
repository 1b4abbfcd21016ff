#pragma once

#include <Zandor/Query.h>
#include <Zandor/model/Finding.h>

class ZandorWidget;

namespace zandor::designer {

/// Whether it is about what an output column is itself: its field, total or sort.
bool isOfColumn(const model::Finding& finding);

/// Brings what a finding is about into view: the table, the columns of the join, or the column of
/// the output column, selected in its table, which becomes the current one; the cell of a criterion
/// becomes the grid's current one, and one of the output column that is wrong itself. Nothing
/// happens when it is no longer in the query.
void showPlace(ZandorWidget& control, zandor::model::Query& query,
               const zandor::model::Finding& finding);

/// Scrolls the canvas by as little as it takes to show a table, or as much of it as goes in.
void bringIntoView(ZandorWidget& control, const TalvikZandorLib::ZDTable& table);

} // namespace zandor::designer

#pragma once

#include "model/Finding.h"
#include "model/Query.h"

class ZandorWidget;

namespace designer {

/// Brings what a finding is about into view: the table, the columns of the join, or the column of
/// the output column, selected in its table, which becomes the current one; the cell of a criterion
/// becomes the grid's current one. Nothing happens when it is no longer in the query.
void showPlace(ZandorWidget& control, model::Query& query, const model::Finding& finding);

/// Scrolls the canvas by as little as it takes to show a table, or as much of it as goes in.
void bringIntoView(ZandorWidget& control, const TalvikZandorLib::ZDTable& table);

} // namespace designer

#pragma once

#include "model/Query.h"

#include <QPoint>

namespace designer {

class Document;

/// Puts tables of a query, arranged among themselves, at a place on the canvas; all of it within
/// what the control can say.
void placeAt(model::Query& query, const std::vector<platform::Ref<model::Table>>& tables,
             QPoint place);

/// Lays all tables of the document out anew by their joins, as one step. Twips.
void arrangeTables(Document& document, int canvasWidth);

} // namespace designer

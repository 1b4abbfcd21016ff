#pragma once

#include <Zandor/Query.h>

#include <QPoint>

namespace zandor::designer {

class Document;

/// Puts a table where none of the others is. Twips.
void placeFree(model::Query& query, const platform::Ref<model::Table>& added, int canvasWidth);

/// Puts tables of a query, arranged among themselves, at a place on the canvas; all of it within
/// what the control can say.
void placeAt(model::Query& query, const std::vector<platform::Ref<model::Table>>& tables,
             QPoint place);

/// Lays all tables of a query out by their joins, where `added` have come to others, which move no
/// further than it is worth. Twips.
void arrangeGrown(model::Query& query, const std::vector<platform::Ref<model::Table>>& added,
                  int canvasWidth);

/// Lays a query out in which some tables have no place yet; one in which all have stays. Tables
/// without a size get one that fits. Twips.
void arrangeUnplaced(model::Query& query, int canvasWidth);

/// Gives tables that have no place one beside what they are joined to, and moves no other. Tables
/// without a size get one that fits. Twips.
void placeUnplaced(model::Query& query, int canvasWidth);

/// Lays all tables of the document out anew by their joins, as one step. Twips.
void arrangeTables(Document& document, int canvasWidth);

} // namespace zandor::designer

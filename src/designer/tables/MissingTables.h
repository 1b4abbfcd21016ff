#pragma once

#include <QObject>

namespace zandor::designer {

class Database;
class Document;
class DrawingArea;

/// Marks in the drawing the tables that the open database does not have, or has no more.
class MissingTables final : public QObject {
    Q_OBJECT

public:
    /// All outlive it; the area is its parent.
    MissingTables(Document& document, Database& database, DrawingArea& area);

private:
    void mark();

    Document& mDocument;
    Database& mDatabase;
    DrawingArea& mArea;
};

} // namespace zandor::designer

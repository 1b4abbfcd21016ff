#pragma once

#include "designer/database/Database.h"
#include "designer/tables/OwnPlaces.h"

#include <Zandor/Query.h>

#include <QPoint>

#include <functional>
#include <optional>

namespace zandor::designer {

class Document;
class DrawingArea;

/// Adds tables of the database to the drawing, with joins by their foreign keys to what is there,
/// and saved queries.
class TableAdding final : public QObject {
    Q_OBJECT

public:
    TableAdding(Document& document, Database& database, DrawingArea& area);

    /// As one step; beside what they are joined to, or at a place on the canvas in twips, which
    /// then is the upper left corner of the first. A drawing that nobody has arranged by hand is
    /// arranged as it grows; of another no table is moved. More tables or joins than the drawing
    /// takes are refused.
    void add(const std::vector<reader::TableId>& tables, std::optional<QPoint> place = {});
    /// A saved query as a table, in the same way.
    void addQuery(const QString& name, const model::SavedQuery& saved,
                  std::optional<QPoint> place = {});
    /// The drawing says what another query says, as one step (see becomeQuery). Tables that come
    /// stand beside what they are joined to, and no other is moved.
    void become(const QString& step, model::Query& other);
    /// The document gets a query whose tables have no places yet, laid out.
    void open(const platform::Ref<model::Query>& query);
    /// Lays all tables out anew, as one step, and from then on as the drawing grows.
    void arrange();
    /// All tables stand now where the designer has put them, and not a person.
    void takeAsArranged() { mPlaces.note(); }

signals:
    /// The tables are there; `name` is that of the last one in the query.
    void added(const QString& name);
    /// One line on what of it one might have expected otherwise.
    void noted(const QString& what);
    /// Nothing was added; one line says why.
    void refused(const QString& why);

private:
    using TableList = std::vector<platform::Ref<model::Table>>;

    /// Refuses them where not.
    bool hasRoomFor(std::size_t tables);
    /// As one step of a name, with the tables where they belong.
    void make(const QString& step, std::optional<QPoint> place,
              const std::function<TableList(model::Query&)>& how);
    /// False when the user has cancelled it or it was refused.
    bool readBefore(const std::vector<reader::TableId>& tables);
    bool fits(const std::vector<reader::TableId>& tables);
    int canvasWidth() const;

    Document& mDocument;
    Database& mDatabase;
    DrawingArea& mArea;
    OwnPlaces mPlaces;
};

} // namespace zandor::designer

#pragma once

#include <Zandor/platform/String.h>

#include <QObject>
#include <QPoint>

#include <map>
#include <vector>

namespace zandor::designer {

class Document;

/// Where the designer itself has put the tables of the drawing. A table that stands elsewhere was
/// put there by a person, and so was one of a query that came from a file.
class OwnPlaces final : public QObject {
    Q_OBJECT

public:
    /// Knows of no place when the document takes another query. It outlives this.
    explicit OwnPlaces(Document& document, QObject* parent = nullptr);

    /// Whether no table stands where a person has put it.
    bool areAll() const;
    /// All tables stand now where the designer has put them.
    void note();

private:
    Document& mDocument;
    /// By the table's key, and all that it ever had, for a step may be undone.
    std::map<platform::String, std::vector<QPoint>> mPlaces;
};

} // namespace zandor::designer

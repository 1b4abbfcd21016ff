#pragma once

#include <QLabel>

namespace zandor::designer {

class Database;
class Document;
class DrawingArea;

/// Says over an empty drawing how a query begins. Takes no mouse and no drops: they go to what is
/// below.
class Invitation final : public QLabel {
    Q_OBJECT

public:
    /// All outlive it.
    Invitation(Document& document, Database& database, DrawingArea& area);

    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void follow();
    void place();

    Document& mDocument;
    Database& mDatabase;
    DrawingArea& mArea;
};

} // namespace zandor::designer

#pragma once

#include "designer/database/Database.h"
#include "designer/statement/readStatement.h"

#include <QTimer>

#include <optional>

namespace zandor::designer {

class Document;
class SqlView;

/// What is typed into the view of the statement becomes the drawing, as one step, when the typing
/// pauses and the text can be read. Until then, and when it cannot, the drawing sleeps: it stays as
/// it is, and the text too, which the document has then.
class StatementTyping final : public QObject {
    Q_OBJECT

public:
    /// Makes the drawing say what a query says, as one step.
    using Draw = std::function<void(model::Query& query)>;

    /// All outlive it. Typing needs an open database.
    StatementTyping(Document& document, Database& database, SqlView& view, Draw draw);

    /// The dialect that is typed. What sleeps is read anew in another one.
    void setDialect(model::sql::Dialect dialect);
    /// The statement that the drawing says now. It is shown, unless what was typed still says it,
    /// or waits to be read.
    void show(const QString& statement);

    /// Puts a text into the view as one who types it, and reads it at once.
    void type(const QString& text);
    /// Reads what waits, at once: nothing goes on without what was typed.
    void readNow();
    /// A document that was replaced has its database now: what came with it is read.
    void readReplaced();
    /// The drawing's statement takes the place of whatever was typed; a step that can be undone.
    void discard();

    /// Whether the text is another than the drawing's.
    bool sleeps() const { return mWaits; }
    /// Why what was typed is not drawn; nothing as long as it was not read.
    const std::optional<Undrawn>& refusal() const { return mRefusal; }
    /// Whether the text is written otherwise than the drawing's statement would be.
    bool isOwnText() const;

    bool eventFilter(QObject* watched, QEvent* event) override;

signals:
    /// sleeps(), refusal() or isOwnText() may be another.
    void changed();

private:
    void heard();
    void keep();
    void follow();
    void replaced();
    void wake();
    void read();
    void readTablesFirst(const std::vector<reader::TableId>& tables);
    void refuse(const Undrawn& why);
    void take(model::Query& query);

    Document& mDocument;
    Database& mDatabase;
    SqlView& mView;
    const Draw mDraw;
    model::sql::Dialect mDialect = model::sql::Dialect::SQLite;
    QTimer mPause;
    QString mStatement;              ///< the drawing's
    std::optional<QString> mDrawnAs; ///< the drawing's, when the text in the view was drawn
    bool mWaits = false;
    bool mComesFirst = false; ///< the database that the text is to be read by
    std::optional<Undrawn> mRefusal;
};

} // namespace zandor::designer

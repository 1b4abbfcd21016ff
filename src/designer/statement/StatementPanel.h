#pragma once

#include "designer/statement/StatementTyping.h"

#include <Zandor/model/Finding.h>
#include <Zandor/sql/Dialect.h>

#include <QTimer>
#include <QWidget>

class QComboBox;
class QListWidget;
class QPushButton;
class QSplitter;

namespace zandor::designer {

class Banner;
class Document;
class FindBar;
class SqlView;

/// The statement that the document's query draws, always as it is now, and what there is to say
/// about it. It is made when control returns to the event loop. Once it knows a database, what is
/// typed into it becomes the drawing (see StatementTyping).
class StatementPanel final : public QWidget {
    Q_OBJECT

public:
    explicit StatementPanel(Document& document, QWidget* parent = nullptr);
    ~StatementPanel() override;

    /// The dialect of the open database, which the statement is in unless another is chosen.
    void setDatabaseDialect(model::sql::Dialect dialect);
    /// The one that the statement is in.
    model::sql::Dialect dialect() const;

    /// To be called once.
    void takeTyping(Database& database, StatementTyping::Draw draw);
    /// Puts a text there as one who types it, and reads it. Only after takeTyping().
    void type(const QString& text) { mTyping->type(text); }
    /// The text as it stands there.
    QString text() const;
    /// What is typed there; nothing before takeTyping().
    StatementTyping* typing() const { return mTyping; }

    QSize minimumSizeHint() const override { return {200, 160}; }

signals:
    /// Somebody wants to see what a finding is about.
    void findingChosen(const model::Finding& finding);
    /// What there is to say now, errors first.
    void findingsChanged(const model::Findings& findings);

public slots:
    /// Puts the statement as it is now on the clipboard, as the engine's own shell takes it, if
    /// there is one; what was typed and is not drawn as it stands.
    void copy();

protected:
    bool event(QEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    void queue();
    void showNow();
    void showFindings(const model::Findings& findings);
    void divide();
    void showTyping();
    void followTyped();
    void choose(int row);

    Document& mDocument;
    model::sql::Dialect mDatabaseDialect = model::sql::Dialect::SQLite;
    model::Findings mFindings; ///< in the order of the list
    QTimer mSoon;
    bool mOutdated = true;
    bool mIsDivided = false; ///< by hand

    QComboBox* mDialects;
    QPushButton* mFormat;
    QPushButton* mCopy;
    SqlView* mView;
    FindBar* mFind;
    Banner* mAsleep; ///< while what is typed is not drawn
    StatementTyping* mTyping = nullptr;
    QListWidget* mList;
    QSplitter* mParts;
};

} // namespace zandor::designer

#pragma once

#include <Zandor/model/Finding.h>
#include <Zandor/sql/Dialect.h>

#include <QTimer>
#include <QWidget>

class QComboBox;
class QListWidget;
class QPushButton;
class QSplitter;

namespace zandor::designer {

class Document;
class SqlView;

/// The statement that the document's query draws, always as it is now, and what there is to say
/// about it. It is made when control returns to the event loop.
class StatementPanel final : public QWidget {
    Q_OBJECT

public:
    explicit StatementPanel(Document& document, QWidget* parent = nullptr);

    /// The dialect of the open database, which the statement is in unless another is chosen.
    void setDatabaseDialect(model::sql::Dialect dialect);
    /// The one that the statement is in.
    model::sql::Dialect dialect() const;

    QSize minimumSizeHint() const override { return {200, 160}; }

signals:
    /// Somebody wants to see what a finding is about.
    void findingChosen(const model::Finding& finding);
    /// What there is to say now, errors first.
    void findingsChanged(const model::Findings& findings);

public slots:
    /// Puts the statement as it is now on the clipboard, as the engine's own shell takes it, if
    /// there is one.
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
    void choose(int row);

    Document& mDocument;
    model::sql::Dialect mDatabaseDialect = model::sql::Dialect::SQLite;
    model::Findings mFindings; ///< in the order of the list
    QTimer mSoon;
    bool mOutdated = true;
    bool mIsDivided = false; ///< by hand

    QComboBox* mDialects;
    QPushButton* mCopy;
    SqlView* mView;
    QListWidget* mList;
    QSplitter* mParts;
};

} // namespace zandor::designer

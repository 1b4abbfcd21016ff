#pragma once

#include "designer/run/Worker.h"

#include <QElapsedTimer>
#include <QTimer>
#include <QWidget>

class QAction;
class QComboBox;
class QLabel;
class QPlainTextEdit;
class QProgressBar;
class QStackedWidget;
class QToolButton;

namespace zandor::designer {

class ChartPanel;
class Database;
class Document;
class ResultTable;
class Spool;
class SummaryLine;

/// Runs the drawn query and shows its rows, or why there are none. One statement runs at a time; it
/// runs on a thread and a connection of its own.
class ResultsPanel final : public QWidget {
    Q_OBJECT

public:
    /// As many rows as can be shown of one result. The table keeps some bytes for each.
    static constexpr qint64 mostRows = 10'000'000;

    /// Both outlive the panel.
    ResultsPanel(Document& document, Database& database, QWidget* parent = nullptr);
    ~ResultsPanel() override;

    // For menus; each is enabled when it can be used.
    QAction* runAction() { return mRun; }
    QAction* cancelAction() { return mCancel; }
    QAction* exportAction() { return mExport; } ///< asks for the file
    QAction* copyAction();
    QAction* chartAction() { return mChartShown; } ///< whether rows are shown as a chart

    /// Shows the rows as a table or as a chart, and gives it the keyboard.
    void goToTable();
    void goToChart();

    /// What the file of an export is called unless the user calls it otherwise; empty: as at first.
    void proposeFile(const QString& path) { mProposed = path; }
    ChartPanel& chart() { return *mChart; }

    /// Runs the query as it is drawn now, or the text that was typed in its place and is not drawn,
    /// and shows its rows, up to the limit. Asks for parameters.
    void run();
    /// Ends what is running, on the engine too.
    void cancel();
    /// Runs the query and writes all its rows into a file of comma-separated values.
    void exportTo(const QString& path);
    bool isRunning() const { return mWorker != nullptr; }

    qint64 limit() const;
    void setLimit(qint64 rows);

signals:
    /// Rows or a message are there to be looked at.
    void shown();

private:
    void makeActions();
    void makeLayout();
    QWidget* makeMessagePage();
    std::optional<Command> command(std::optional<qint64> limit);
    std::optional<Command> drawnCommand(std::optional<qint64> limit);
    std::optional<Command> typedCommand(std::optional<qint64> limit);
    bool answerAll(const std::vector<Question>& questions);
    void start(const Command& command, const std::shared_ptr<Sink>& sink, const QString& file);
    void progress();
    void finish(const Outcome& outcome);
    void giveUp();
    void stopped();
    void askForFile();
    void runAll();
    void forget();
    QString whyEmpty() const;
    void takeAsked();
    platform::String drawn();
    bool isOutdated();
    void queryChanged();
    void showSpool();
    bool areRowsShown() const;
    void showRows();
    void drawChart();
    void sort(int column, Qt::SortOrder direction);
    void showMessage(const QString& text, const QString& statement = {});
    void setStatus(const QString& text);
    void showStatus();
    QString seconds() const;

    Document& mDocument;
    Database& mDatabase;
    QString mAddress; ///< where the rows that are shown came from
    QMap<QString, QString> mAnswers;
    QString mStatement;          ///< that ran last
    bool mComparesTexts = false; ///< the query that ran last
    platform::String mAsked;     ///< by the query whose rows are shown
    bool mAskedTyped = false;    ///< as a text that was typed, and not by the drawing
    QString mProposed;           ///< for the file of an export
    QString mFile;               ///< that is being exported to; empty otherwise
    std::shared_ptr<Spool> mSpool;
    WorkerPointer mWorker;
    QElapsedTimer mClock;
    QTimer mLook;     ///< at what has come
    QTimer mPatience; ///< with a server that is to stop
    QString mState;   ///< of the rows or the run
    QString mSorting; ///< how the rows are sorted here; empty: as they came
    bool mFitted = false;
    bool mOutdated = false;
    bool mIsOfTyped = false; ///< what the status tells of

    QAction* mRun;
    QAction* mCancel;
    QAction* mExport;
    QAction* mChartShown;
    QComboBox* mLimit;
    QProgressBar* mBusy;
    QStackedWidget* mPages;
    QLabel* mMessage;
    QPlainTextEdit* mMessageStatement;
    ResultTable* mTable;
    ChartPanel* mChart;
    QLabel* mStatus;
    SummaryLine* mSummary;
    QToolButton* mAll;
};

} // namespace zandor::designer

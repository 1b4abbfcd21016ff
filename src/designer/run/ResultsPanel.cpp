#include "designer/run/ResultsPanel.h"

#include "designer/PlainBox.h"
#include "designer/chart/ChartPanel.h"
#include "designer/database/Database.h"
#include "designer/database/patiently.h"
#include "designer/document/Document.h"
#include "designer/run/FileExport.h"
#include "designer/run/ParameterDialog.h"
#include "designer/run/ResultTable.h"
#include "designer/run/SummaryLine.h"
#include "designer/run/typedCommand.h"
#include "designer/statement/ModelWords.h"
#include "frontends/qt/ShownText.h"

#include <QAction>
#include <QComboBox>
#include <QFileDialog>
#include <QLabel>
#include <QLocale>
#include <QPlainTextEdit>
#include <QProgressBar>
#include <QStackedWidget>
#include <QToolButton>

namespace zandor::designer {

namespace {

constexpr std::chrono::milliseconds betweenLooks(100);
constexpr std::chrono::seconds serversTime(10); // to stop a statement

QString number(qint64 value) { return QLocale().toString(value); }

} // namespace

// The layout is in ResultsPanelLayout.cpp.
ResultsPanel::ResultsPanel(Document& document, Database& database, QWidget* parent)
    : QWidget(parent), mDocument(document), mDatabase(database) {
    makeActions();
    makeLayout();
    mLook.setInterval(betweenLooks);
    connect(&mLook, &QTimer::timeout, this, &ResultsPanel::progress);
    mPatience.setInterval(serversTime);
    mPatience.setSingleShot(true);
    connect(&mPatience, &QTimer::timeout, this, &ResultsPanel::giveUp);
    connect(&mDocument, &Document::replaced, this, &ResultsPanel::forget);
    connect(&mDocument, &Document::changed, this, &ResultsPanel::queryChanged);
    connect(&mDocument, &Document::typedChanged, this, &ResultsPanel::queryChanged);
    connect(&mDatabase, &Database::opened, this, [this] {
        if (mDatabase.address() != mAddress) forget();
    });
    connect(&mTable->rows(), &ResultModel::sortWished, this, &ResultsPanel::sort);
    connect(mTable, &ResultTable::tooMuchToCopy, this, [this] {
        setStatus(tr("These are too many cells to copy; export the rows instead."));
    });
    forget();
}

ResultsPanel::~ResultsPanel() = default;

QAction* ResultsPanel::copyAction() { return mTable->copyAction(); }

void ResultsPanel::run() {
    if (isRunning()) return;
    const auto made = command(limit());
    if (!made) return;
    mSpool = std::make_shared<Spool>();
    takeAsked();
    showSpool();
    mTable->rows().setFormats(mAskedTyped ? ColumnFormats() : ColumnFormats(*mDocument.query()));
    mFitted = false;
    start(*made, mSpool, {});
    showRows();
    emit shown();
}

void ResultsPanel::runAll() {
    setLimit(mostRows);
    run();
}

void ResultsPanel::exportTo(const QString& path) {
    if (isRunning()) return;
    if (const auto made = command({})) start(*made, std::make_shared<FileExport>(path), path);
}

/// Nothing when there is none, which is shown, or when the user asks no further.
std::optional<Command> ResultsPanel::command(std::optional<qint64> limit) {
    if (!mDatabase.isOpen()) {
        showMessage(tr("No database is open: open one first."));
        return {};
    }
    mDocument.settle();
    return mDocument.typed() ? typedCommand(limit) : drawnCommand(limit);
}

std::optional<Command> ResultsPanel::drawnCommand(std::optional<qint64> limit) {
    const auto dialect = mDatabase.dialect();
    const auto text = statementFor(*mDocument.query(), dialect, limit);
    if (!text.runnable()) {
        QStringList lines(tr("The query cannot be run yet:"));
        for (const model::Finding& finding : text.findings)
            if (finding.isError()) lines << QStringLiteral("\u2022 ") + inWords(finding.message);
        showMessage(lines.join(u'\n'));
        return {};
    }
    if (!answerAll(questions(text))) return {};
    mComparesTexts = comparesTexts(text);
    return makeCommand(text, dialect, mAnswers, limit);
}

std::optional<Command> ResultsPanel::typedCommand(std::optional<qint64> limit) {
    const auto typed = typedRun(*mDocument.typed(), mDatabase.dialect());
    if (!typed) {
        showMessage(tr("The text that was typed cannot be run:\n%1").arg(typed.failure()));
        return {};
    }
    if (!answerAll(questions(*typed))) return {};
    mComparesTexts = false; // nobody knows
    return makeCommand(*typed, mAnswers, limit);
}

/// The answers are kept for the next time.
bool ResultsPanel::answerAll(const std::vector<Question>& questions) {
    if (questions.empty()) return true;
    ParameterDialog dialog(questions, mAnswers, this);
    if (dialog.exec() != QDialog::Accepted) return false;
    mAnswers.insert(dialog.answers());
    return true;
}

void ResultsPanel::start(const Command& command, const std::shared_ptr<Sink>& sink,
                         const QString& file) {
    mStatement = command.statement;
    mIsOfTyped = command.isTyped;
    mFile = file;
    if (file.isEmpty()) mAddress = mDatabase.address();
    mWorker.reset(new Worker(mDatabase.connector(), command, sink));
    connect(mWorker.get(), &Worker::progressed, this, &ResultsPanel::progress);
    connect(mWorker.get(), &Worker::ended, this, &ResultsPanel::finish);
    mRun->setEnabled(false);
    mExport->setEnabled(false);
    mCancel->setEnabled(true);
    mAll->hide();
    mBusy->show();
    mClock.start();
    mLook.start();
    progress();
    mWorker->start();
}

void ResultsPanel::cancel() {
    if (!isRunning()) return;
    mWorker->cancel();
    mCancel->setEnabled(false);
    mPatience.start();
    progress();
}

void ResultsPanel::progress() {
    if (!isRunning()) return;
    const bool exporting = !mFile.isEmpty();
    if (!exporting) {
        ResultModel& rows = mTable->rows();
        rows.refresh();
        if (!mFitted && rows.rowCount() > 0) {
            mFitted = true;
            mTable->fitColumns();
        }
    }
    const QString state = !mCancel->isEnabled() ? tr("Cancelling\u2026")
                          : exporting           ? tr("Exporting\u2026")
                                                : tr("Running\u2026");
    setStatus(tr("%1  Rows so far: %2 \u00b7 %3").arg(state, number(mWorker->rows()), seconds()));
}

/// The server has not answered since it was asked to stop.
void ResultsPanel::giveUp() {
    if (!isRunning()) return;
    // It ends when the connection does; nobody waits for that.
    Worker* const left = mWorker.release();
    left->disconnect();
    connect(left, &QThread::finished, left, &QObject::deleteLater);
    const QString message = tr("The server does not answer.");
    stopped();
    mDatabase.sayLost(message);
    showMessage(message, mStatement);
}

void ResultsPanel::stopped() {
    mFile.clear();
    mLook.stop();
    mPatience.stop();
    mWorker.reset();
    mRun->setEnabled(true);
    mExport->setEnabled(true);
    mCancel->setEnabled(false);
    mBusy->hide();
}

void ResultsPanel::finish(const Outcome& outcome) {
    progress();
    const QString file = mFile;
    stopped();
    mSorting.clear(); // it can be done from now on
    // The engine has answered, whatever it said.
    using End = Outcome::End;
    if (outcome.end == End::complete || outcome.end == End::limited || outcome.end == End::failed)
        mDatabase.sayFound();
    const QString rows = number(outcome.rows);
    const bool exporting = !file.isEmpty();
    switch (outcome.end) {
    case Outcome::End::complete:
        setStatus(exporting ? tr("Exported to %1. Rows: %2 \u00b7 %3").arg(file, rows, seconds())
                            : tr("Rows: %1 \u00b7 %2").arg(rows, seconds()));
        if (!exporting && outcome.rows == 0) mTable->setEmptyText(whyEmpty());
        break;
    case Outcome::End::limited:
        setStatus(tr("First %1 rows; there are more \u00b7 %2").arg(rows, seconds()));
        mAll->setVisible(outcome.rows < mostRows);
        break;
    case Outcome::End::cancelled:
        setStatus(exporting ? tr("Cancelled; nothing was exported \u00b7 %1").arg(seconds())
                            : tr("Cancelled. Rows that came: %1 \u00b7 %2").arg(rows, seconds()));
        break;
    case Outcome::End::unreachable:
        showMessage(outcome.message);
        mDatabase.sayLost(outcome.message);
        break;
    case Outcome::End::refused: showMessage(outcome.message); break;
    case Outcome::End::failed:
        showMessage(tr("The database did not run the statement:\n%1").arg(outcome.message),
                    mStatement);
        break;
    case Outcome::End::lost:
        showMessage(tr("The connection to the database has broken down:\n%1").arg(outcome.message),
                    mStatement);
        mDatabase.sayLost(outcome.message);
        break;
    }
    if (!exporting && areRowsShown() && !mFitted) mTable->fitColumns();
    drawChart();
    queryChanged(); // while it ran
}

void ResultsPanel::askForFile() {
    const QString path = QFileDialog::getSaveFileName(
        this, tr("Export all rows"), mProposed.isEmpty() ? tr("rows.csv") : mProposed,
        tr("Comma-separated values (*.csv)"));
    if (path.isEmpty()) return;
    const bool named = path.endsWith(QLatin1String(".csv"), Qt::CaseInsensitive);
    exportTo(named ? path : path + QLatin1String(".csv"));
}

QString ResultsPanel::whyEmpty() const {
    QString none = tr("The query finds no rows.");
    if (!mComparesTexts) return none;
    return none + u'\n' +
           tr("A text has to be the same as a whole, and on most databases in capital and small "
              "letters: Like *berlin* finds Berlin wherever it stands.");
}

/// Of another query or database there are no rows yet. What is being exported still is wanted.
void ResultsPanel::forget() {
    if (mFile.isEmpty()) stopped();
    mSpool.reset();
    showSpool();
    mAll->hide();
    mAddress = mDatabase.address();
    showMessage(tr("Run the query to see its rows here."));
}

void ResultsPanel::takeAsked() {
    const auto& typed = mDocument.typed();
    mAskedTyped = typed.has_value();
    mAsked = typed ? typed->text : drawn();
}

/// What the drawing asks for at the moment, of which places, widths and comments are no part.
platform::String ResultsPanel::drawn() {
    const auto dialect = mDatabase.dialect();
    auto run = statementText(*mDocument.query(), dialect, model::sql::ValueForm::bound);
    for (const auto& binding : run.bindings) {
        const auto* value = std::get_if<model::sql::Value>(&binding);
        run.text += u'\n';
        run.text += value ? model::sql::literal(*value, dialect)
                          : u':' + std::get<model::sql::Parameter>(binding).name;
    }
    return std::move(run.text);
}

bool ResultsPanel::isOutdated() {
    if (!mAskedTyped) return drawn() != mAsked;
    return !mDocument.typed() || mDocument.typed()->text != mAsked;
}

void ResultsPanel::queryChanged() {
    if (isRunning() || !mSpool || !areRowsShown()) return;
    const bool outdated = isOutdated();
    // How values are shown is no part of what is asked for, and seen at once.
    if (!outdated && !mAskedTyped && mTable->rows().setFormats(ColumnFormats(*mDocument.query()))) {
        mTable->widenColumns();
        drawChart();
    }
    if (mOutdated == outdated) return;
    mOutdated = outdated;
    showStatus();
}

void ResultsPanel::showSpool() {
    mTable->showSorting(-1);
    mTable->rows().setSpool(mSpool);
    mTable->setEmptyText({});
    mSorting.clear();
    mOutdated = false;
}

bool ResultsPanel::areRowsShown() const { return mPages->currentIndex() != 0; }

/// As a table or as a chart.
void ResultsPanel::showRows() {
    const bool charted = mChartShown->isChecked();
    mPages->setCurrentWidget(charted ? static_cast<QWidget*>(mChart) : mTable);
    setFocusProxy(mPages->currentWidget());
    mSummary->setVisible(!charted && !mSummary->text().isEmpty());
    drawChart();
}

/// Only as long as it is seen: it reads rows.
void ResultsPanel::drawChart() {
    if (mPages->currentWidget() != mChart) return;
    if (isRunning() && mFile.isEmpty())
        return mChart->say(tr("The chart is drawn when the rows have come."));
    const ResultModel& rows = mTable->rows();
    QStringList columns;
    std::vector<CellFormat> formats;
    for (int column = 0; column < rows.columnCount(); ++column) {
        columns << (mSpool ? mSpool->columns().value(column) : QString());
        formats.push_back(rows.format(column));
    }
    mChart->show({columns, rows.rowCount(),
                  [&rows](int row, int column) { return rows.cell(rows.index(row, column)); },
                  formats});
}

void ResultsPanel::goToTable() {
    mChartShown->setChecked(false);
    mTable->setFocus(Qt::ShortcutFocusReason);
}

void ResultsPanel::goToChart() {
    mChartShown->setChecked(true);
    mChart->setFocus(Qt::ShortcutFocusReason);
}

/// Sorts the rows that are shown, and not the query: neither is it changed nor run again.
void ResultsPanel::sort(int column, Qt::SortOrder direction) {
    ResultModel& rows = mTable->rows();
    const qint64 count = rows.rowCount();
    const auto refuse = [&](const QString& why) {
        mTable->showSorting(-1);
        rows.setOrder({});
        mSorting = why;
        showStatus();
        drawChart();
    };
    mTable->clearSelection();
    if (column < 0 || count == 0) return refuse({});
    if (isRunning()) return refuse(tr("the rows can be sorted when all of them have come"));
    if (count > mostRowsSorted)
        return refuse(tr("these are too many rows to sort here; use the row \"Sort:\" of the "
                         "drawing"));
    const auto stop = std::make_shared<std::atomic<bool>>(false);
    const auto spool = mSpool;
    const auto sorted =
        patiently<std::optional<RowOrder>>(tr("Sorting the rows\u2026"), window(), [=] {
            return sortedRows(*spool, column, direction, count, *stop);
        });
    *stop = true;                // when nobody waits for it any longer
    if (mSpool != spool) return; // they are gone by now
    if (!sorted || !*sorted) return refuse({});
    rows.setOrder(**sorted);
    const QString name = rows.headerData(column, Qt::Horizontal).toString();
    mSorting = direction == Qt::AscendingOrder
                   ? tr("these rows are sorted by %1 here, the query is not").arg(name)
                   : tr("these rows are sorted by %1 descending here, the query is not").arg(name);
    showStatus();
    drawChart();
}

void ResultsPanel::showMessage(const QString& text, const QString& statement) {
    mMessage->setText(linesAsSigns(text));
    mMessageStatement->setPlainText(statement);
    mMessageStatement->setVisible(!statement.isEmpty());
    mPages->setCurrentIndex(0);
    mSummary->hide();
    setStatus({});
    emit shown();
}

void ResultsPanel::setStatus(const QString& text) {
    mState = text;
    showStatus();
}

void ResultsPanel::showStatus() {
    QStringList parts{mState};
    if (mIsOfTyped && !mState.isEmpty())
        parts << tr("of the text that was typed, not of the drawing");
    if (!mSorting.isEmpty()) parts << mSorting;
    if (mOutdated)
        parts << (mAskedTyped ? tr("the text has changed since")
                              : tr("the drawing has changed since"));
    const QString text = parts.join(QStringLiteral(" \u00b7 "));
    mStatus->setText(platform::qt::asSigns(text));
    mStatus->setToolTip(platform::qt::asToolTip(text));
}

QString ResultsPanel::seconds() const {
    return tr("%1 s").arg(QLocale().toString(static_cast<double>(mClock.elapsed()) / 1000, 'f', 1));
}

} // namespace zandor::designer

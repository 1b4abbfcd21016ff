#include "designer/chart/ChartPanel.h"
#include "designer/run/ResultTable.h"
#include "designer/run/ResultsPanel.h"
#include "designer/run/SummaryLine.h"
#include "designer/run/shapeIcon.h"

#include <QAction>
#include <QComboBox>
#include <QFontDatabase>
#include <QLabel>
#include <QLocale>
#include <QPlainTextEdit>
#include <QProgressBar>
#include <QStackedWidget>
#include <QStyle>
#include <QTextDocument>
#include <QToolBar>
#include <QToolButton>
#include <QVBoxLayout>

// What the panel looks like.

namespace zandor::designer {

namespace {

constexpr qint64 limits[] = {1'000, 10'000, 100'000, 1'000'000, ResultsPanel::mostRows};
constexpr qint64 usualLimit = 10'000;
constexpr int busyHeight = 3; // logical pixels

} // namespace

void ResultsPanel::makeActions() {
    mRun = new QAction(shapeIcon({{0.2, 0.1}, {0.9, 0.5}, {0.2, 0.9}}), tr("&Run"), this);
    mRun->setShortcut(Qt::Key_F5);
    mRun->setToolTip(tr("Run the query and show its rows (F5)"));
    connect(mRun, &QAction::triggered, this, &ResultsPanel::run);

    mCancel = new QAction(shapeIcon({{0.15, 0.15}, {0.85, 0.15}, {0.85, 0.85}, {0.15, 0.85}}),
                          tr("&Cancel"), this);
    mCancel->setShortcuts({Qt::Key_Escape, Qt::CTRL | Qt::Key_Period});
    mCancel->setToolTip(tr("Stop what is running, on the database too (Esc)"));
    connect(mCancel, &QAction::triggered, this, &ResultsPanel::cancel);

    mExport = new QAction(style()->standardIcon(QStyle::SP_DialogSaveButton),
                          tr("&Export rows\u2026"), this);
    mExport->setIconText(tr("Export\u2026")); // beside the rows
    mExport->setToolTip(tr("Run the query and write all its rows into a CSV file"));
    connect(mExport, &QAction::triggered, this, &ResultsPanel::askForFile);

    // Three columns on a line.
    mChartShown = new QAction(shapeIcon({{0.1, 0.9},
                                         {0.1, 0.5},
                                         {0.3, 0.5},
                                         {0.3, 0.8},
                                         {0.4, 0.8},
                                         {0.4, 0.1},
                                         {0.6, 0.1},
                                         {0.6, 0.8},
                                         {0.7, 0.8},
                                         {0.7, 0.3},
                                         {0.9, 0.3},
                                         {0.9, 0.9}}),
                              tr("C&hart"), this);
    mChartShown->setCheckable(true);
    mChartShown->setToolTip(tr("Show the rows as a chart (Ctrl+5), and as a table again (Ctrl+4)"));
    connect(mChartShown, &QAction::toggled, this, [this] {
        if (areRowsShown()) showRows();
    });
}

void ResultsPanel::makeLayout() {
    mLimit = new QComboBox(this);
    mLimit->setObjectName(QStringLiteral("rowLimit"));
    mLimit->setToolTip(tr("So many rows are shown at most"));
    for (const qint64 limit : limits)
        mLimit->addItem(tr("%1 rows").arg(QLocale().toString(limit)), limit);
    setLimit(usualLimit);

    auto* bar = new QToolBar(this);
    bar->setToolButtonStyle(Qt::ToolButtonTextBesideIcon);
    const int icon = style()->pixelMetric(QStyle::PM_SmallIconSize);
    bar->setIconSize(QSize(icon, icon));
    bar->addAction(mRun);
    bar->addAction(mCancel);
    bar->addWidget(mLimit);
    bar->addAction(mExport);
    bar->addSeparator();
    bar->addAction(mChartShown);

    mBusy = new QProgressBar(this);
    mBusy->setRange(0, 0);
    mBusy->setTextVisible(false);
    mBusy->setFixedHeight(busyHeight);
    QSizePolicy keepsItsRoom = mBusy->sizePolicy();
    keepsItsRoom.setRetainSizeWhenHidden(true);
    mBusy->setSizePolicy(keepsItsRoom);
    mBusy->hide();

    mTable = new ResultTable(this);
    mPages = new QStackedWidget(this);
    mPages->addWidget(makeMessagePage());
    mPages->addWidget(mTable);
    mChart = new ChartPanel(this);
    mPages->addWidget(mChart);
    setFocusProxy(mTable);

    mStatus = new QLabel(this);
    mStatus->setObjectName(QStringLiteral("runStatus"));
    mStatus->setTextFormat(Qt::PlainText);
    mStatus->setWordWrap(true);
    mStatus->setTextInteractionFlags(Qt::TextSelectableByMouse);
    mAll = new QToolButton(this);
    mAll->setObjectName(QStringLiteral("allRows"));
    mAll->setText(tr("All rows"));
    mAll->setToolTip(tr("Run the query again without the limit"));
    connect(mAll, &QToolButton::clicked, this, &ResultsPanel::runAll);
    mSummary = new SummaryLine(*mTable, this);
    mTable->addCommand(tr("Copy s&ummary"), "copySummary", [this] { mSummary->copyAll(); });
    auto* foot = new QHBoxLayout;
    foot->setContentsMargins(6, 3, 6, 3);
    foot->addWidget(mStatus, 1);
    foot->addWidget(mSummary);
    foot->addWidget(mAll);

    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins({});
    layout->setSpacing(0);
    layout->addWidget(bar);
    layout->addWidget(mBusy);
    layout->addWidget(mPages, 1);
    layout->addLayout(foot);
}

QWidget* ResultsPanel::makeMessagePage() {
    auto* page = new QWidget;
    page->setBackgroundRole(QPalette::Base);
    page->setAutoFillBackground(true);
    mMessage = new QLabel(page);
    mMessage->setObjectName(QStringLiteral("runMessage"));
    mMessage->setTextFormat(Qt::PlainText);
    mMessage->setWordWrap(true);
    mMessage->setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
    mMessageStatement = new QPlainTextEdit(page);
    mMessageStatement->setObjectName(QStringLiteral("failedStatement"));
    mMessageStatement->setReadOnly(true);
    mMessageStatement->setFrameShape(QFrame::NoFrame);
    mMessageStatement->document()->setDocumentMargin(0);
    mMessageStatement->setFont(QFontDatabase::systemFont(QFontDatabase::FixedFont));
    auto* layout = new QVBoxLayout(page);
    layout->setContentsMargins(12, 10, 12, 10);
    layout->setSpacing(8);
    layout->addWidget(mMessage);
    layout->addWidget(mMessageStatement, 1);
    layout->addStretch();
    return page;
}

qint64 ResultsPanel::limit() const { return mLimit->currentData().toLongLong(); }

void ResultsPanel::setLimit(qint64 rows) {
    if (const int place = mLimit->findData(rows); place >= 0) mLimit->setCurrentIndex(place);
}

} // namespace zandor::designer

#include "designer/statement/StatementPanel.h"

#include "designer/Banner.h"
#include "designer/document/Document.h"
#include "designer/statement/FindBar.h"
#include "designer/statement/ModelWords.h"
#include "designer/statement/NameCompletion.h"
#include "designer/statement/SqlView.h"
#include "frontends/qt/ShownText.h"

#include <Zandor/qt/Text.h>
#include <Zandor/sql/Builder.h>

#include <QBoxLayout>
#include <QClipboard>
#include <QComboBox>
#include <QGuiApplication>
#include <QKeyEvent>
#include <QListWidget>
#include <QPushButton>
#include <QScrollBar>
#include <QSplitter>
#include <QStyle>

#include <algorithm>
#include <iterator>

namespace zandor::designer {

namespace {

using model::sql::Dialect;
using platform::qt::toQt;

constexpr int aroundFinding = 4; // logical pixels

QString shownName(Dialect dialect) { return toQt(model::sql::nameOf(dialect)); }

} // namespace

StatementPanel::StatementPanel(Document& document, QWidget* parent)
    : QWidget(parent), mDocument(document), mDialects(new QComboBox),
      mFormat(new QPushButton(tr("Format"))), mCopy(new QPushButton(tr("Copy"))),
      mView(new SqlView), mFind(new FindBar(*mView)), mAsleep(new Banner), mList(new QListWidget),
      mParts(new QSplitter(Qt::Vertical)) {
    mDialects->addItem({});
    for (const Dialect dialect : model::sql::allDialects) mDialects->addItem(shownName(dialect));
    mDialects->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    mDialects->setMinimumContentsLength(8);
    mDialects->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Fixed);
    mDialects->setMaximumWidth(fontMetrics().averageCharWidth() * 50);
    mDialects->setToolTip(tr("The dialect of SQL that the statement is written in"));
    mDialects->setAccessibleName(tr("Dialect"));
    setDatabaseDialect(mDatabaseDialect);
    mCopy->setToolTip(tr("Copy the statement to the clipboard"));
    mCopy->setObjectName(QStringLiteral("copy"));
    mFormat->setObjectName(QStringLiteral("format"));
    mFormat->setToolTip(tr("Write the statement as the drawing says it"));
    mFormat->hide();
    mAsleep->setObjectName(QStringLiteral("asleep"));
    mView->setObjectName(QStringLiteral("statement"));
    mView->setAccessibleName(tr("SQL statement"));
    mView->setFrameShape(QFrame::NoFrame);
    mList->setObjectName(QStringLiteral("findings"));
    mList->setAccessibleName(tr("Findings"));
    mList->setWordWrap(true);
    mList->setIconSize({16, 16});
    mList->setResizeMode(QListView::Adjust);
    mList->setFrameShape(QFrame::NoFrame);
    mList->setToolTip(tr("Click a finding to see its place"));
    mList->installEventFilter(this);

    auto* const top = new QHBoxLayout;
    top->setContentsMargins(6, 4, 6, 4);
    top->setSpacing(6);
    top->addWidget(mDialects, 1);
    top->addStretch();
    top->addWidget(mFormat);
    top->addWidget(mCopy);
    auto* const editor = new QWidget;
    auto* const below = new QVBoxLayout(editor);
    below->setContentsMargins({});
    below->setSpacing(0);
    below->addWidget(mView, 1);
    below->addWidget(mAsleep);
    below->addWidget(mFind);
    mParts->addWidget(editor);
    mParts->addWidget(mList);
    mParts->setChildrenCollapsible(false);
    mParts->setStretchFactor(0, 1);
    mParts->setStretchFactor(1, 0);
    mList->setMinimumHeight(mList->fontMetrics().height() + 2 * aroundFinding);
    connect(mParts, &QSplitter::splitterMoved, this, [this] { mIsDivided = true; });
    auto* const layout = new QVBoxLayout(this);
    layout->setContentsMargins({});
    layout->setSpacing(0);
    layout->addLayout(top);
    layout->addWidget(mParts, 1);

    setFocusProxy(mView);
    mSoon.setSingleShot(true);
    connect(&mSoon, &QTimer::timeout, this, &StatementPanel::showNow);
    connect(&document, &Document::changed, this, &StatementPanel::queue);
    connect(mDialects, &QComboBox::currentIndexChanged, this, &StatementPanel::queue);
    connect(mCopy, &QPushButton::clicked, this, &StatementPanel::copy);
    connect(mList, &QListWidget::itemClicked, this,
            [this](QListWidgetItem* item) { choose(mList->row(item)); });
    showNow();
}

StatementPanel::~StatementPanel() {
    delete mTyping; // which the view, that loses the keyboard as it goes, would call
}

void StatementPanel::takeTyping(Database& database, StatementTyping::Draw draw) {
    mTyping = new StatementTyping(mDocument, database, *mView, std::move(draw));
    mTyping->setDialect(dialect());
    new NameCompletion(*mView, database, [this] { return dialect(); });
    mFormat->show();
    auto* const back =
        mAsleep->addButton(tr("&Back to the drawing"), QStringLiteral("backToDrawing"));
    back->setToolTip(tr("The drawing's own statement takes the place of the text (Esc)"));
    connect(back, &QPushButton::clicked, this, [this] {
        mTyping->discard();
        mView->setFocus();
    });
    connect(mFormat, &QPushButton::clicked, mTyping, &StatementTyping::discard);
    connect(mTyping, &StatementTyping::changed, this, &StatementPanel::showTyping);
    connect(&database, &Database::opened, this, &StatementPanel::queue);
    connect(&mDocument, &Document::replaced, this, &StatementPanel::followTyped);
    connect(&mDocument, &Document::typedChanged, this, &StatementPanel::followTyped);
    showNow();
}

/// A text stays in the dialect that it was typed in.
void StatementPanel::followTyped() {
    const auto& typed = mDocument.typed();
    if (!typed || typed->dialect == dialect()) return;
    const auto* const found = std::ranges::find(model::sql::allDialects, typed->dialect);
    mDialects->setCurrentIndex(static_cast<int>(found - std::begin(model::sql::allDialects)) + 1);
}

QString StatementPanel::text() const { return mView->text(); }

/// What is typed is in one of four states: it is drawn, it is not read yet, it cannot be, or it
/// came with its query and there is no database to read it by.
void StatementPanel::showTyping() {
    mFormat->setEnabled(mTyping->isOwnText() && !mTyping->sleeps());
    mCopy->setEnabled(!mView->text().isEmpty());
    const auto& why = mTyping->refusal();
    mView->setAccessibleDescription(why ? why->withPlace() : mView->placeholderText());
    if (why)
        mAsleep->say(
            tr("%1 The drawing sleeps until this can be read; Run takes the text as it is.")
                .arg(why->withPlace()));
    else if (mTyping->sleeps() && mView->isReadOnly())
        mAsleep->say(tr("This text is not drawn, and the drawing sleeps: open a database, and it "
                        "is read."));
    else
        mAsleep->hide();
}

void StatementPanel::setDatabaseDialect(Dialect dialect) {
    mDatabaseDialect = dialect;
    mDialects->setItemText(0, tr("%1 (as the database)").arg(shownName(dialect)));
    followTyped();
    queue();
}

Dialect StatementPanel::dialect() const {
    const int chosen = mDialects->currentIndex();
    return chosen <= 0 ? mDatabaseDialect : model::sql::allDialects[chosen - 1];
}

void StatementPanel::copy() {
    const bool asTyped = mTyping && mTyping->sleeps();
    const QString text = asTyped ? mView->text()
                                 : toQt(model::sql::statementText(*mDocument.query(), dialect(),
                                                                  model::sql::ValueForm::script)
                                            .text);
    if (!text.isEmpty()) QGuiApplication::clipboard()->setText(text);
}

void StatementPanel::queue() {
    mOutdated = true;
    if (!mSoon.isActive()) mSoon.start();
}

void StatementPanel::showEvent(QShowEvent* event) {
    QWidget::showEvent(event);
    if (mOutdated) showNow();
}

bool StatementPanel::event(QEvent* event) {
    // The list's icons are the style's.
    if (event->type() == QEvent::StyleChange || event->type() == QEvent::PaletteChange) queue();
    return QWidget::event(event);
}

bool StatementPanel::eventFilter(QObject* watched, QEvent* event) {
    // Only then it knows how its findings wrap.
    if (watched == mList && event->type() == QEvent::Resize)
        QMetaObject::invokeMethod(this, &StatementPanel::divide, Qt::QueuedConnection);
    if (watched == mList && event->type() == QEvent::KeyPress) {
        const int key = static_cast<QKeyEvent*>(event)->key();
        if (key == Qt::Key_Return || key == Qt::Key_Enter || key == Qt::Key_Space)
            return choose(mList->currentRow()), true;
    }
    return QWidget::eventFilter(watched, event);
}

void StatementPanel::showNow() {
    mSoon.stop();
    mOutdated = false;
    const auto written =
        model::sql::statementText(*mDocument.query(), dialect(), model::sql::ValueForm::literal);
    const QString text = toQt(written.text);
    QString instead;
    if (mDocument.query()->Tables().Count() == 0) {
        instead = mView->isReadOnly()
                      ? tr("Add a table to begin: the statement appears here.")
                      : tr("Add a table to begin, or write a SELECT here: it becomes the drawing.");
    } else if (text.isEmpty()) {
        QStringList why{tr("%1 cannot say this query:").arg(shownName(dialect()))};
        for (const model::Finding& finding : written.findings)
            if (finding.isError()) why << inWords(finding.message);
        instead = why.join(QStringLiteral("\n\n"));
    }
    mView->setPlaceholderText(instead);
    mView->setAccessibleDescription(instead);
    if (mTyping) {
        mTyping->setDialect(dialect());
        mTyping->show(text);
        showTyping();
    } else {
        mView->setStatement(text);
        mCopy->setEnabled(!text.isEmpty());
    }
    showFindings(written.findings);
}

void StatementPanel::showFindings(const model::Findings& findings) {
    const int current = mList->currentRow();
    const int scrolled = mList->verticalScrollBar()->value();
    mFindings.clear();
    // That there is nothing yet is said where the statement will be.
    std::copy_if(
        findings.begin(), findings.end(), std::back_inserter(mFindings),
        [](const auto& finding) { return finding.kind != model::Finding::Kind::noTables; });
    std::stable_partition(mFindings.begin(), mFindings.end(),
                          [](const auto& finding) { return finding.isError(); });
    mList->clear();
    for (const model::Finding& finding : mFindings) {
        const bool error = finding.isError();
        auto* const item =
            new QListWidgetItem(style()->standardIcon(error ? QStyle::SP_MessageBoxCritical
                                                            : QStyle::SP_MessageBoxWarning),
                                platform::qt::asSigns(inWords(finding.message)), mList);
        item->setData(Qt::AccessibleTextRole,
                      (error ? tr("Error: %1") : tr("Warning: %1")).arg(item->text()));
    }
    mList->setCurrentRow(std::min(current, mList->count() - 1));
    mList->setVisible(!mFindings.empty());
    divide();
    mList->verticalScrollBar()->setValue(scrolled);
    emit findingsChanged(mFindings);
}

/// The findings have the room that they need, up to a half, until somebody gives them another.
void StatementPanel::divide() {
    if (mIsDivided || mFindings.empty()) return;
    const QListWidgetItem* const last = mList->item(mList->count() - 1);
    const int bottom = mList->visualItemRect(last).bottom() + mList->verticalScrollBar()->value();
    const int room = mParts->height() - mParts->handleWidth();
    const int needed = std::min(bottom + 2 * mList->frameWidth() + aroundFinding, room / 2);
    mParts->setSizes({room - needed, needed});
}

void StatementPanel::resizeEvent(QResizeEvent* event) {
    QWidget::resizeEvent(event);
    divide();
}

void StatementPanel::choose(int row) {
    if (row < 0 || row >= static_cast<int>(mFindings.size())) return;
    // By value: whoever shows the place may change the findings.
    const model::Finding finding = mFindings[static_cast<std::size_t>(row)];
    emit findingChosen(finding);
}

} // namespace zandor::designer

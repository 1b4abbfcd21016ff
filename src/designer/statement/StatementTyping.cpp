#include "designer/statement/StatementTyping.h"

#include "designer/database/patiently.h"
#include "designer/database/readTables.h"
#include "designer/document/Document.h"
#include "designer/statement/ModelWords.h"
#include "designer/statement/SqlView.h"

#include <Zandor/qt/Text.h>
#include <Zandor/sql/Builder.h>

#include <QApplication>
#include <QEvent>
#include <QFutureWatcher>

namespace zandor::designer {

using platform::qt::fromQt;
using platform::qt::toQt;

namespace {

constexpr int pause = 500; // milliseconds

} // namespace

StatementTyping::StatementTyping(Document& document, Database& database, SqlView& view, Draw draw)
    : QObject(&view), mDocument(document), mDatabase(database), mView(view),
      mDraw(std::move(draw)) {
    mPause.setSingleShot(true);
    mPause.setInterval(pause);
    connect(&mPause, &QTimer::timeout, this, &StatementTyping::read);
    connect(&view, &SqlView::typing, this, &StatementTyping::heard);
    connect(&view, &SqlView::left, this, [this] {
        if (mWaits) discard();
    });
    connect(&view, &SqlView::turnedAway, this, &StatementTyping::readNow);
    qApp->installEventFilter(this);
    connect(&document, &Document::replaced, this, &StatementTyping::replaced);
    connect(&document, &Document::typedChanged, this, &StatementTyping::follow);
    const auto lock = [this] { mView.setReadOnly(!mDatabase.isOpen()); };
    connect(&database, &Database::opened, this, lock);
    connect(&database, &Database::opened, this, &StatementTyping::readReplaced);
    lock();
}

bool StatementTyping::isOwnText() const { return mView.text() != mStatement; }

void StatementTyping::setDialect(model::sql::Dialect dialect) {
    if (std::exchange(mDialect, dialect) == dialect || !mWaits) return;
    keep();
    mPause.start();
}

void StatementTyping::show(const QString& statement) {
    mStatement = statement;
    if (mWaits || mDrawnAs == statement) return;
    mDrawnAs.reset();
    mView.setStatement(statement);
    emit changed();
}

void StatementTyping::type(const QString& text) {
    // What stands there and is not drawn would be gone with the step that draws this one.
    if (mWaits && mView.text() != text) discard();
    mView.type(text);
    readNow();
}

void StatementTyping::readNow() {
    if (mPause.isActive()) read();
}

bool StatementTyping::eventFilter(QObject* watched, QEvent* event) {
    // A button need not take the keyboard away.
    if (event->type() == QEvent::MouseButtonPress && mPause.isActive() && watched->isWidgetType() &&
        watched != mView.viewport() && !QApplication::activePopupWidget())
        read();
    return QObject::eventFilter(watched, event);
}

void StatementTyping::discard() {
    wake();
    mDocument.giveUpTyped(tr("Back to the drawing"));
}

void StatementTyping::wake() {
    mPause.stop();
    mWaits = false;
    mRefusal.reset();
    mDrawnAs.reset();
    mView.setStatement(mStatement);
    emit changed();
}

/// Of another document, or of a step of this one.
void StatementTyping::follow() {
    const auto& typed = mDocument.typed();
    const QString text = typed ? toQt(typed->text) : QString();
    if (typed && mWaits && mView.text() == text) return;
    if (!typed && !mWaits) return;
    if (!typed) return wake();
    mView.setStatement(text);
    mWaits = true;
    mRefusal.reset();
    if (!mComesFirst) mPause.start();
    emit changed();
}

void StatementTyping::replaced() {
    wake();
    mComesFirst = mDocument.typed().has_value();
    follow();
}

void StatementTyping::readReplaced() {
    if (!mDatabase.isOpen()) return;
    mComesFirst = false;
    if (mWaits) mPause.start();
}

void StatementTyping::keep() {
    if (mWaits)
        mDocument.setTyped(files::TypedStatement{fromQt(mView.text()), mDialect});
    else
        mDocument.setTyped({});
}

void StatementTyping::heard() {
    mRefusal.reset();
    mView.mark(-1);
    mComesFirst = false;
    mWaits = mView.text() != mStatement;
    if (mWaits)
        mPause.start();
    else
        mPause.stop();
    keep();
    emit changed();
}

void StatementTyping::read() {
    mPause.stop();
    if (mComesFirst || !mDatabase.isOpen()) return;
    const QString text = mView.text();
    const auto named = tablesNamedIn(text, mDatabase.tables());
    // A file is read as quickly as memory.
    if (mDatabase.isServer() && !unknownOf(mDatabase, {named, {}}).empty())
        return readTablesFirst(named);
    const auto query = readStatement(text, {mDatabase.reader(), mDatabase.tables(), mDialect});
    if (query)
        take(**query);
    else
        refuse(query.failure());
}

void StatementTyping::readTablesFirst(const std::vector<reader::TableId>& tables) {
    const auto read = std::make_shared<std::optional<TablesRead>>();
    const Wanted wanted = unknownOf(mDatabase, {tables, {}});
    auto* const watcher = new QFutureWatcher<void>(this);
    const QString address = mDatabase.address();
    const QString text = mView.text();
    connect(watcher, &QFutureWatcher<void>::finished, this, [=, this] {
        watcher->deleteLater();
        // Somebody has typed on meanwhile, or does not want it any more.
        if (!mWaits || mView.text() != text || mDatabase.address() != address) return;
        if (const auto error = takeTables(mDatabase, **read)) return refuse({inWords(*error)});
        this->read();
    });
    watcher->setFuture(startOnThread([read, wanted, connector = mDatabase.connector()] {
        read->emplace(readTables(connector, wanted));
    }));
}

void StatementTyping::refuse(const Undrawn& why) {
    mRefusal = why;
    if (why.line > 0) mView.mark(why.position);
    emit changed();
}

void StatementTyping::take(model::Query& query) {
    mWaits = false;
    mDraw(query);
    mStatement =
        toQt(statementText(*mDocument.query(), mDialect, model::sql::ValueForm::literal).text);
    mDrawnAs = mStatement;
    mView.forgetTyping();
    keep();
    emit changed();
}

} // namespace zandor::designer

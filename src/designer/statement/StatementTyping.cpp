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
    // What was typed for another query says nothing of this one.
    connect(&document, &Document::replaced, this, &StatementTyping::discard);
    const auto follow = [this] { mView.setReadOnly(!mDatabase.isOpen()); };
    connect(&database, &Database::opened, this, follow);
    follow();
}

bool StatementTyping::isOwnText() const { return mView.text() != mStatement; }

void StatementTyping::show(const QString& statement) {
    mStatement = statement;
    if (mWaits || mDrawnAs == statement) return;
    mDrawnAs.reset();
    mView.setStatement(statement);
    emit changed();
}

void StatementTyping::type(const QString& text) {
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
    mPause.stop();
    mWaits = false;
    mRefusal.reset();
    mDrawnAs.reset();
    mView.setStatement(mStatement);
    emit changed();
}

void StatementTyping::heard() {
    mRefusal.reset();
    mView.mark(-1);
    mWaits = mView.text() != mStatement;
    if (mWaits)
        mPause.start();
    else
        mPause.stop();
    emit changed();
}

void StatementTyping::read() {
    mPause.stop();
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
    mStatement = platform::qt::toQt(
        statementText(*mDocument.query(), mDialect, model::sql::ValueForm::literal).text);
    mDrawnAs = mStatement;
    mView.forgetTyping();
    emit changed();
}

} // namespace zandor::designer

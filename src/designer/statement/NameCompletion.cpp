#include "designer/statement/NameCompletion.h"

#include "designer/database/Database.h"
#include "designer/statement/SqlView.h"
#include "designer/statement/readStatement.h"

#include <Zandor/qt/Text.h>

#include <QAbstractItemView>
#include <QCompleter>
#include <QKeyEvent>
#include <QRegularExpression>
#include <QScrollBar>
#include <QStringListModel>
#include <QTextBlock>

#include <algorithm>

namespace zandor::designer {

namespace {

constexpr int shortestWord = 2;
constexpr int mostNames = 200; // more nobody reads

} // namespace

NameCompletion::NameCompletion(SqlView& view, Database& database,
                               std::function<model::sql::Dialect()> dialect)
    : QObject(&view), mView(view), mDatabase(database), mDialect(std::move(dialect)),
      mCompleter(new QCompleter(this)), mNames(new QStringListModel(this)) {
    mCompleter->setModel(mNames);
    mCompleter->setWidget(&view);
    mCompleter->setCompletionMode(QCompleter::UnfilteredPopupCompletion);
    mCompleter->popup()->setObjectName(QStringLiteral("names"));
    connect(mCompleter, qOverload<const QString&>(&QCompleter::activated), this,
            &NameCompletion::take);
    view.setKeyHandler([this](const QKeyEvent& key) { return hear(key); });
}

QString NameCompletion::wordBefore() const {
    static const QRegularExpression word(QStringLiteral("[\\p{L}_][\\p{L}\\d_]*$"));
    const QTextCursor cursor = mView.textCursor();
    return word.match(cursor.block().text().left(cursor.positionInBlock())).captured();
}

/// Of a table by its name or by what the text calls it, as far as they are known.
QStringList NameCompletion::columnsOf(const QString& called) const {
    QStringList columns;
    const QString text = mView.text();
    for (const reader::TableId& id : tablesNamedIn(text, mDatabase.tables())) {
        // Those of a server are known once the statement was read.
        if (mDatabase.isServer() && !mDatabase.reader().knowsTable(id)) continue;
        const QString name = platform::qt::toQt(id.name);
        const QRegularExpression alias(
            QStringLiteral("\\b%1[\"`\\]]?\\s+(as\\s+)?[\"`\\[]?%2\\b")
                .arg(QRegularExpression::escape(name), QRegularExpression::escape(called)),
            QRegularExpression::CaseInsensitiveOption |
                QRegularExpression::UseUnicodePropertiesOption);
        const bool meant = called.isEmpty() || called.compare(name, Qt::CaseInsensitive) == 0 ||
                           alias.match(text).hasMatch();
        if (!meant) continue;
        const auto description = mDatabase.reader().table(id);
        if (!description) continue;
        for (const auto& column : description->columns)
            columns << platform::qt::toQt(model::sql::identifier(column.name, mDialect()));
    }
    return columns;
}

QStringList NameCompletion::offered() const {
    static const QRegularExpression qualifier(QStringLiteral("([\\p{L}_][\\p{L}\\d_]*)\\.$"));
    const QString word = wordBefore();
    const QTextCursor cursor = mView.textCursor();
    const QString before =
        cursor.block().text().left(cursor.positionInBlock() - static_cast<int>(word.size()));
    const QString table = qualifier.match(before).captured(1);
    QStringList names = columnsOf(table);
    if (table.isEmpty())
        for (const reader::TableEntry& entry : mDatabase.tables())
            names << platform::qt::toQt(model::sql::identifier(entry.id.name, mDialect()));
    names.removeDuplicates();
    const auto begins = [&](const QString& name) {
        const qsizetype at = name.isEmpty() || name[0].isLetter() || name[0] == u'_' ? 0 : 1;
        return name.mid(at).startsWith(word, Qt::CaseInsensitive);
    };
    names.erase(std::remove_if(names.begin(), names.end(), std::not_fn(begins)), names.end());
    std::stable_sort(names.begin(), names.end(), [](const QString& one, const QString& other) {
        return one.compare(other, Qt::CaseInsensitive) < 0;
    });
    return names.mid(0, mostNames);
}

void NameCompletion::offer(bool asked) {
    const QString word = wordBefore();
    const QTextCursor cursor = mView.textCursor();
    const int at = cursor.positionInBlock() - static_cast<int>(word.size());
    const bool behindPoint = at > 0 && cursor.block().text()[at - 1] == u'.';
    if (!asked && !behindPoint && word.size() < shortestWord) return mCompleter->popup()->hide();
    const QStringList names = offered();
    const bool isThere = names.size() == 1 && names.front().compare(word, Qt::CaseInsensitive) == 0;
    if (names.isEmpty() || isThere) return mCompleter->popup()->hide();
    mNames->setStringList(names);
    QAbstractItemView* const list = mCompleter->popup();
    QRect place = mView.cursorRect();
    place.setWidth(list->sizeHintForColumn(0) + list->verticalScrollBar()->sizeHint().width() + 8);
    mCompleter->complete(place);
}

void NameCompletion::take(const QString& name) {
    QTextCursor cursor = mView.textCursor();
    cursor.movePosition(QTextCursor::Left, QTextCursor::KeepAnchor,
                        static_cast<int>(wordBefore().size()));
    cursor.insertText(name);
    mView.setTextCursor(cursor);
}

/// While the list is open some keys are for it.
bool NameCompletion::hear(const QKeyEvent& key) {
    if (mView.isReadOnly()) return false;
    QAbstractItemView* const list = mCompleter->popup();
    const bool isOpen = list->isVisible();
    if (isOpen && key.key() == Qt::Key_Escape) return list->hide(), true;
    if (isOpen &&
        (key.key() == Qt::Key_Return || key.key() == Qt::Key_Enter || key.key() == Qt::Key_Tab)) {
        const QModelIndex chosen = list->currentIndex();
        list->hide();
        if (chosen.isValid()) return take(chosen.data().toString()), true;
    }
    if (key.key() == Qt::Key_Space && key.modifiers() == Qt::ControlModifier)
        return offer(true), true;
    const bool types = !key.text().isEmpty() && key.text().front().isPrint() &&
                       !key.modifiers().testFlag(Qt::ControlModifier);
    // Once the key has done what it does.
    if (types || isOpen)
        QMetaObject::invokeMethod(
            this, [this] { offer(false); }, Qt::QueuedConnection);
    return false;
}

} // namespace zandor::designer

#pragma once

#include <Zandor/sql/Dialect.h>

#include <QObject>
#include <QStringList>

#include <functional>

class QCompleter;
class QKeyEvent;
class QStringListModel;

namespace zandor::designer {

class Database;
class SqlView;

/// Offers names while a statement is typed: the tables of the database, and the columns of those
/// whose names stand in the text, as the dialect writes them. Behind a table and a point its
/// columns alone. Ctrl+Space offers them at once.
class NameCompletion final : public QObject {
    Q_OBJECT

public:
    NameCompletion(SqlView& view, Database& database, std::function<model::sql::Dialect()> dialect);

    /// What there is for the word before the cursor.
    QStringList offered() const;

private:
    QString wordBefore() const;
    QStringList columnsOf(const QString& called) const;
    bool hear(const QKeyEvent& key);
    void offer(bool asked);
    void take(const QString& name);

    SqlView& mView;
    Database& mDatabase;
    const std::function<model::sql::Dialect()> mDialect;
    QCompleter* mCompleter;
    QStringListModel* mNames;
};

} // namespace zandor::designer

#include "designer/tables/TableTip.h"

#include "designer/database/patiently.h"
#include "designer/statement/ModelWords.h"
#include "designer/tables/TableListModel.h"
#include "frontends/qt/ShownText.h"

#include <QCoreApplication>
#include <QFuture>
#include <QHelpEvent>
#include <QListView>
#include <QToolTip>

namespace zandor::designer {

namespace {

constexpr std::size_t mostColumns = 24; // a tip that fits on a small screen

constexpr qsizetype widest = 60; // characters of a name

/// A name in a tip, which is HTML.
QString inTip(const platform::String& name) {
    const QString shown = platform::qt::asSigns(QString::fromStdU16String(name));
    return (shown.size() > widest ? shown.left(widest - 1) + u'\u2026' : shown).toHtmlEscaped();
}

} // namespace

TableTip::TableTip(Database& database, const TableListModel& model, QListView& list)
    : QObject(&list), mDatabase(database), mModel(model), mList(list) {
    list.viewport()->installEventFilter(this);
    connect(&database, &Database::opened, this, [this] { mAsked.reset(); });
}

bool TableTip::eventFilter(QObject*, QEvent* event) {
    if (event->type() == QEvent::Leave) mAsked.reset();
    if (event->type() != QEvent::ToolTip) return false;
    const auto* const help = static_cast<QHelpEvent*>(event);
    const QModelIndex index = mList.indexAt(help->pos());
    mAsked.reset();
    if (!index.isValid() || !mDatabase.isOpen()) {
        QToolTip::hideText();
        return true;
    }
    const reader::TableEntry& table = mModel.entry(index.row());
    if (!mDatabase.isServer() || mDatabase.reader().knowsTable(table.id))
        show(table, help->globalPos());
    else if (!mDatabase.isLost())
        read(table, help->globalPos());
    return true;
}

void TableTip::show(const reader::TableEntry& table, QPoint at) {
    const auto columns = mDatabase.reader().table(table.id);
    QToolTip::showText(at,
                       columns ? tipText(*columns, table.isView)
                               : platform::qt::asToolTip(inWords(columns.failure())),
                       mList.viewport());
}

void TableTip::read(const reader::TableEntry& table, QPoint at) {
    mAsked = table;
    const auto result = std::make_shared<std::optional<TablesRead>>();
    startOnThread([result, connect = mDatabase.connector(), id = table.id] {
        result->emplace(readTables(connect, {{id}, {}}));
    }).then(this, [this, result, table, at] {
        if (mAsked != table) return; // the mouse is elsewhere by now
        mAsked.reset();
        if (!takeTables(mDatabase, **result)) show(table, at);
    });
}

QString tipText(const model::TableDescription& table, bool isView) {
    const auto text = [](const char* words) {
        return QCoreApplication::translate("zandor::designer::TableTip", words);
    };
    const QString name = inTip(table.name);
    QString tip =
        QStringLiteral("<p style='white-space:pre'><b>%1</b></p><table>")
            .arg(isView
                     ? text(QT_TRANSLATE_NOOP("zandor::designer::TableTip", "%1 (view)")).arg(name)
                     : name);
    const std::size_t shown = std::min(table.columns.size(), mostColumns);
    for (std::size_t n = 0; n < shown; ++n) {
        const auto& column = table.columns[n];
        const QString own = inTip(column.name);
        tip += QStringLiteral("<tr><td>%1&nbsp;&nbsp;</td><td>%2</td></tr>")
                   .arg(column.primaryKey ? QStringLiteral("<u>%1</u>").arg(own) : own,
                        inTip(column.declaredType));
    }
    tip += QStringLiteral("</table>");
    if (shown < table.columns.size())
        tip += QStringLiteral("<p>%1</p>")
                   .arg(text(QT_TRANSLATE_NOOP("zandor::designer::TableTip", "and %1 more"))
                            .arg(table.columns.size() - shown));
    return tip;
}

} // namespace zandor::designer

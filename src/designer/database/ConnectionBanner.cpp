#include "designer/database/ConnectionBanner.h"

#include "designer/database/opening.h"

#include <QPushButton>

namespace zandor::designer {

ConnectionBanner::ConnectionBanner(Database& database, QWidget* parent)
    : Banner(parent), mDatabase(database) {
    const auto* const again = addButton(tr("&Reconnect"), QStringLiteral("reconnect"));
    connect(&database, &Database::lost, this, &ConnectionBanner::showLoss);
    connect(&database, &Database::outdated, this, &ConnectionBanner::showChange);
    connect(&database, &Database::opened, this, &QWidget::hide);
    connect(&database, &Database::found, this, &QWidget::hide);
    connect(again, &QPushButton::clicked, this, &ConnectionBanner::reconnect);
}

void ConnectionBanner::showLoss(const QString& message) {
    say(tr("The connection to %1 is lost. Your query is kept.").arg(mDatabase.name()), message);
}

void ConnectionBanner::showChange(Database::Change change) {
    const QString name = mDatabase.name();
    switch (change) {
    case Database::Change::gone:
        return say(tr("The file of %1 is no longer there. Your query is kept.").arg(name));
    case Database::Change::replaced:
        return say(tr("%1 has been replaced by another file since it was opened.").arg(name));
    case Database::Change::altered:
        return say(tr("The tables of %1 have been changed by another program.").arg(name));
    }
}

void ConnectionBanner::reconnect() {
    const Opening opening = renewPatiently(mDatabase, window());
    if (!opening.error.isEmpty()) say(opening.error);
}

} // namespace zandor::designer

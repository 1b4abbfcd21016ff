#pragma once

#include "designer/Banner.h"
#include "designer/database/Database.h"

namespace zandor::designer {

/// There while the database is lost, or is no longer what was read of it; with a button that
/// connects it afresh.
class ConnectionBanner final : public Banner {
    Q_OBJECT

public:
    explicit ConnectionBanner(Database& database, QWidget* parent = nullptr);

private:
    void showLoss(const QString& message);
    void showChange(Database::Change change);
    void reconnect();

    Database& mDatabase;
};

} // namespace zandor::designer

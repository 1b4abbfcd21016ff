#pragma once

#include <QFrame>

class QLabel;

namespace designer {

class Database;

/// A slim bar that is there while the database is lost, with a button that connects it afresh.
class ConnectionBanner final : public QFrame {
    Q_OBJECT

public:
    explicit ConnectionBanner(Database& database, QWidget* parent = nullptr);

protected:
    void changeEvent(QEvent* event) override;

private:
    void colour();
    void showLoss(const QString& message);
    void reconnect();

    Database& mDatabase;
    QLabel* mText;
};

} // namespace designer

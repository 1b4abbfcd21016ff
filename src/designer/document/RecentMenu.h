#pragma once

#include <QMenu>

namespace zandor::designer {

class RecentFiles;

/// "Open recent": an entry for each file or database, greyed when it is gone, and "Clear list".
class RecentMenu final : public QMenu {
    Q_OBJECT

public:
    explicit RecentMenu(RecentFiles& recent, QWidget* parent = nullptr);

signals:
    void chosen(const QString& fileOrAddress);

private:
    void fill();

    RecentFiles& mRecent;
};

} // namespace zandor::designer

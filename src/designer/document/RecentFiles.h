#pragma once

#include <QObject>
#include <QSettings>
#include <QStringList>

namespace zandor::designer {

/// The files, or databases, that were used last, the newest first; remembered in the settings. An
/// address is remembered without its password.
class RecentFiles final : public QObject {
    Q_OBJECT

public:
    static constexpr int most = 10;

    /// The list under a name of its own ("queries", "databases"). The settings outlive this.
    RecentFiles(QSettings& settings, const QString& name, QObject* parent = nullptr);

    QStringList list() const;
    void add(const QString& fileOrAddress);
    void clear();

    /// Whether it can be opened, as far as can be seen from here: a file that is gone cannot.
    static bool isThere(const QString& fileOrAddress);

signals:
    void changed();

private:
    QSettings& mSettings;
    const QString mKey;
};

} // namespace zandor::designer

#include "designer/document/RecentFiles.h"

#include "designer/database/Address.h"

#include <QFileInfo>

namespace zandor::designer {

RecentFiles::RecentFiles(QSettings& settings, const QString& name, QObject* parent)
    : QObject(parent), mSettings(settings), mKey(QStringLiteral("recent/") + name) {}

QStringList RecentFiles::list() const { return mSettings.value(mKey).toStringList().mid(0, most); }

void RecentFiles::add(const QString& fileOrAddress) {
    const QString added = partPassword(fileOrAddress).address;
    if (added.isEmpty()) return;
    QStringList entries = list();
    entries.removeAll(added);
    entries.prepend(added);
    mSettings.setValue(mKey, entries.mid(0, most));
    emit changed();
}

void RecentFiles::clear() {
    mSettings.remove(mKey);
    emit changed();
}

bool RecentFiles::isThere(const QString& fileOrAddress) {
    const auto address = parseAddress(fileOrAddress);
    if (!address || address->engine != Engine::SQLite) return true; // behind a network
    return QFileInfo::exists(address->file);
}

} // namespace zandor::designer

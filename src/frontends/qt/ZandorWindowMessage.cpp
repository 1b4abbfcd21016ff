#include "frontends/qt/ZandorWindowMessage.h"

#include <QHash>
#include <QMutex>
#include <QMutexLocker>

namespace {

struct Registered {
    QMutex mutex;
    QHash<QString, QEvent::Type> types;
};

Registered& registered() {
    static Registered all;
    return all;
}

} // namespace

QEvent::Type ZandorWindowMessage::typeOf(const QString& name) {
    Registered& all = registered();
    const QMutexLocker lock(&all.mutex);
    const auto known = all.types.constFind(name);
    if (known != all.types.constEnd()) return *known;
    const int fresh = QEvent::registerEventType();
    if (fresh < 0) return QEvent::None;
    return *all.types.insert(name, static_cast<Type>(fresh));
}

QString ZandorWindowMessage::name() const {
    Registered& all = registered();
    const QMutexLocker lock(&all.mutex);
    return all.types.key(type());
}

#include "designer/tables/leftOutWords.h"

#include <Zandor/qt/Text.h>

#include <QCoreApplication>
#include <QStringList>

#include <algorithm>

namespace zandor::designer {

using platform::qt::toQt;

namespace {

/// "trips.from"; of a key with several columns the first is enough to know it by.
QString nameOf(const reader::ForeignKey& key) {
    return toQt(key.child.name) + u'.' + toQt(key.columns.front().first);
}

} // namespace

QString leftOutWords(const std::vector<reader::LeftOut>& leftOut) {
    QStringList sentences;
    std::vector<reader::ForeignKey> said;
    for (const auto& [drawn, first] : leftOut) {
        if (std::find(said.begin(), said.end(), drawn) != said.end()) continue;
        said.push_back(drawn);
        QStringList others;
        for (const auto& each : leftOut)
            if (each.drawn == drawn) others << nameOf(each.other);
        others.sort(Qt::CaseInsensitive);
        sentences << QCoreApplication::translate(
                         "zandor::designer::TableAdding",
                         "%1 and %2 are joined by %3. Not joined by %4: draw those yourself if you "
                         "need them.")
                         .arg(toQt(drawn.child.name), toQt(drawn.parent.name), nameOf(drawn),
                              others.join(QStringLiteral(", ")));
    }
    return sentences.join(u' ').simplified();
}

} // namespace zandor::designer

#include "designer/options/EventWords.h"

#include <Zandor/model/ColumnDefinition.h>
#include <Zandor/model/Table.h>
#include <Zandor/qt/Text.h>

#include <QCoreApplication>

#include <iterator>

namespace zandor::designer {

namespace {

using platform::qt::toQt;

QString gone() { return QCoreApplication::translate("zandor::designer::EventWords", "(gone)"); }

QString named(const auto& table, const auto& column) {
    return QStringLiteral("%1.%2").arg(table ? toQt(table->Name()) : gone(),
                                       column ? toQt(column->Name()) : gone());
}

} // namespace

QString wordsFor(const platform::Ref<TalvikZandorLib::ZDColumnDefinition>& definition) {
    const auto own = std::dynamic_pointer_cast<model::ColumnDefinition>(definition);
    if (!own) return gone();
    return named(own->place().table().table(), own->place().column());
}

QString wordsFor(const platform::Ref<TalvikZandorLib::ZDJoin>& join) {
    if (!join) return gone();
    static constexpr const char16_t* symbols[] = {u"=", u"<>", u"<", u">", u"<=", u">="};
    const auto compared = static_cast<std::size_t>(join->CompareOperator());
    return QStringLiteral("%1 %2 %3")
        .arg(named(join->LeftTable(), join->LeftColumn()),
             compared < std::size(symbols) ? QString::fromUtf16(symbols[compared])
                                           : QStringLiteral("?"),
             named(join->RightTable(), join->RightColumn()));
}

} // namespace zandor::designer

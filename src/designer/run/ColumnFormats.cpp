#include "designer/run/ColumnFormats.h"

#include <Zandor/Query.h>

namespace zandor::designer {

bool isOfSeveral(const model::ColumnDefinition& definition) {
    const auto column = definition.place().column();
    return column && definition.place().table().table()->isAllColumns(*column) &&
           !model::aggregates(definition.total());
}

ColumnFormats::ColumnFormats(model::Query& query) {
    bool isFirst = true;
    for (const auto& each :
         platform::Each<TalvikZandorLib::ZDColumnDefinition>(query.ColumnDefinitions())) {
        const auto& definition = dynamic_cast<const model::ColumnDefinition&>(*each);
        if (!definition.comesOut()) continue;
        if (isOfSeveral(definition)) {
            isFirst = false;
            mLast.clear();
            continue;
        }
        auto& formats = isFirst ? mFirst : mLast;
        formats.insert(isFirst ? formats.end() : formats.begin(),
                       {definition.format(), definition.decimals()});
    }
}

CellFormat ColumnFormats::at(int column, int columns) const {
    const auto place = static_cast<std::size_t>(column);
    if (place < mFirst.size()) return mFirst[place];
    const auto fromRight = static_cast<std::size_t>(columns - 1 - column);
    return fromRight < mLast.size() ? mLast[fromRight] : CellFormat();
}

} // namespace zandor::designer

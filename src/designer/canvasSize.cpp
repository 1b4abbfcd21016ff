#include "designer/canvasSize.h"

#include <Zandor/model/Layout.h>

#include <algorithm>
#include <limits>

namespace zandor::designer {

QSize canvasNeeded(model::Query& query) {
    QSize size;
    for (const auto& table : platform::Each<TalvikZandorLib::ZDTable>(query.Tables()))
        size = size.expandedTo(QSize(table->Left() + table->Width() + model::layout::margin,
                                     table->Top() + table->Height() + model::layout::margin));
    return size.isValid() ? size : QSize(0, 0);
}

int canvasLength(int twips) {
    return std::clamp<int>(twips, 0, std::numeric_limits<std::int16_t>::max());
}

int twips(int pixels) { return canvasLength(pixels * twipsPerPixel); }

QSize pixels(QSize twips) {
    constexpr int roundUp = twipsPerPixel - 1;
    return {(twips.width() + roundUp) / twipsPerPixel, (twips.height() + roundUp) / twipsPerPixel};
}

} // namespace zandor::designer

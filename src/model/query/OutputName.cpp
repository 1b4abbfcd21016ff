#include <Zandor/model/OutputName.h>

#include <Zandor/model/Table.h>

namespace zandor::model {

namespace {

String nameOf(const ColumnPlace& place) {
    const auto column = place.column();
    if (!column) return {};
    // "*" is no column to be totalled: it is the rows that are counted.
    if (place.table().table()->isAllColumns(*column)) return String(Column::allColumns);
    return Column::field(column)->Name();
}

} // namespace

String OutputName::Name() const {
    String name = mExpression.text.empty() ? nameOf(mPlace) : mExpression.text;
    if (mTotal == Total::None) return name;
    return String(wordOf(mTotal)) + u'(' + std::move(name) + u')';
}

} // namespace zandor::model

#include <Zandor/model/Total.h>

namespace zandor::model {

platform::StringView wordOf(Total total) {
    switch (total) {
    case Total::None: break;
    case Total::Group: return u"group";
    case Total::Count: return u"count";
    case Total::CountDifferent: return u"different";
    case Total::Sum: return u"sum";
    case Total::Average: return u"average";
    case Total::Smallest: return u"smallest";
    case Total::Largest: return u"largest";
    case Total::Condition: return u"condition";
    }
    return {};
}

ColumnType typeOf(Total total, ColumnType values) {
    switch (total) {
    case Total::Count:
    case Total::CountDifferent: return ColumnType::Integer;
    case Total::Average: return ColumnType::Decimal;
    default: return values;
    }
}

bool suits(Total total, ColumnType type) {
    switch (total) {
    case Total::Sum:
    case Total::Average:
        return type == ColumnType::Integer || type == ColumnType::Decimal ||
               type == ColumnType::Unknown;
    case Total::Smallest:
    case Total::Largest: return type != ColumnType::Boolean && type != ColumnType::Blob;
    default: return true;
    }
}

} // namespace zandor::model

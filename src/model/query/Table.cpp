#include <Zandor/model/Table.h>

#include <Zandor/model/Names.h>
#include <Zandor/platform/Numbers.h>

namespace zandor::model {

Table::Table(TablePlace place, String name, String schema, String sourceName,
             TableContents contents)
    : mPlace(std::move(place)), mName(mRevision, std::move(name)), mSchema(std::move(schema)),
      mSourceName(std::move(sourceName)),
      mContents(mRevision, std::make_shared<TableContents>(std::move(contents))) {}

void Table::Left(float value) { mLeft = platform::toLong(value); }
void Table::Top(float value) { mTop = platform::toLong(value); }
void Table::Width(float value) { mWidth = platform::toLong(value); }
void Table::Height(float value) { mHeight = platform::toLong(value); }

bool Table::Activate(const std::vector<String>& keys) {
    if (savedQuery()) return false;
    const auto& columns = (*mContents)->columns;
    // Of a table of thousands each press comes by all of them.
    const std::int32_t count = columns.Count();
    for (std::int32_t position = 1; position <= count; ++position)
        static_cast<Column&>(*columns.Peek(position)).activated(0);
    for (const String& key : keys) columns.Item(key)->activated(1);
    return true;
}

Ref<Column> Table::column(const String& key) const {
    const auto& columns = (*mContents)->columns;
    if (!columns.Contains(key)) return {};
    return std::static_pointer_cast<Column>(columns.Item(key));
}

Ref<Column> Table::columnNamed(platform::StringView name) const {
    const auto& columns = (*mContents)->columns;
    Ref<Column> alike;
    // A column that is really called "*" stands behind the entry, so the entry is passed over.
    for (std::int32_t position = 2; position <= columns.Count(); ++position) {
        const auto column = std::static_pointer_cast<Column>(columns.Item(position));
        if (column->description().name == name) return column;
        if (!alike && sameName(column->description().name, name)) alike = column;
    }
    return alike;
}

bool Table::isAllColumns(const Column& column) const {
    return column.Key() == (*mContents)->columns.Item(1)->Key();
}

Ref<Table> tableNamed(const TalvikZandorLib::Collection<TalvikZandorLib::ZDTable>& tables,
                      platform::StringView name) {
    for (const auto& table : platform::Each<TalvikZandorLib::ZDTable>(tables))
        if (sameName(table->Name(), name)) return std::static_pointer_cast<Table>(table);
    return {};
}

} // namespace zandor::model

#include "ReaderSchema.h"

#include <Zandor/model/Names.h>

#include <map>
#include <stdexcept>

using namespace zandor;

sql_reader::Schema schemaOf(reader::DatabaseReader& database) {
    const auto tables = database.tables();
    if (!tables) throw std::runtime_error(tables.error().toStdString());
    auto known = std::make_shared<std::map<platform::String, model::TableDescription>>();
    sql_reader::Schema schema;
    for (const auto& entry : *tables) {
        const auto described = database.table(entry.id);
        if (!described) throw std::runtime_error(described.error().toStdString());
        known->emplace(model::foldedName(entry.id.name), *described);
        schema.names.push_back(entry.id.name);
    }
    schema.table = [known](platform::StringView, platform::StringView name)
        -> std::optional<model::TableDescription> {
        const auto at = known->find(model::foldedName(name));
        if (at == known->end()) return {};
        return at->second;
    };
    return schema;
}

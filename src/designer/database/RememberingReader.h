#pragma once

#include <Zandor/DatabaseReader.h>

#include <optional>

namespace zandor::designer {

/// What was read about a table.
struct KnownTable {
    reader::TableId id;
    std::optional<model::TableDescription> description;
    std::optional<std::vector<reader::ForeignKey>> foreignKeys;
};

/// Reads each thing once. What another thread has read beforehand is not read at all.
class RememberingReader final : public reader::DatabaseReader {
public:
    explicit RememberingReader(std::unique_ptr<DatabaseReader> reader);

    reader::Result<std::vector<reader::TableEntry>> tables() override;
    reader::Result<model::TableDescription> table(const reader::TableId& id) override;
    reader::Result<std::vector<reader::ForeignKey>>
    foreignKeys(const reader::TableId& child) override;

    bool knowsTable(const reader::TableId& id) const;
    bool knowsForeignKeys(const reader::TableId& child) const;
    void remember(const std::vector<KnownTable>& tables);

private:
    const KnownTable* known(const reader::TableId& id) const;
    KnownTable& entry(const reader::TableId& id);

    std::unique_ptr<DatabaseReader> mReader;
    std::vector<KnownTable> mKnown; ///< some dozens, for a query has 16 tables
};

} // namespace zandor::designer

#pragma once

#include <Zandor/model/export.h>

#include "model/criteria/Parser.h"

#include <Zandor/model/Table.h>

namespace zandor::model::criteria {

/// The columns that criteria of one query may name: those of its tables.
class ZANDOR_MODEL_EXPORT QueryColumns final : public Resolver {
public:
    /// `tables` must outlive the object.
    explicit QueryColumns(const TalvikZandorLib::Collection<TalvikZandorLib::ZDTable>& tables)
        : mTables(tables) {}

    std::vector<NamedColumn> columnsNamed(StringView table, StringView column) const override;
    std::vector<NamedColumn> columnsNamed(StringView column) const override;

private:
    const TalvikZandorLib::Collection<TalvikZandorLib::ZDTable>& mTables;
};

} // namespace zandor::model::criteria

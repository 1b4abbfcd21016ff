#pragma once

#include <Zandor/TalvikZandorLib.h>
#include <Zandor/model/export.h>

namespace zandor::model {

class Column;

/// A column as the grid of output columns names it: "orders.total", under the name that its table
/// has at the moment, so that equal columns of two tables can be told apart. In everything else it
/// is the column, which it is a part of.
class ZANDOR_MODEL_EXPORT FieldColumn final : public TalvikZandorLib::ZDColumn {
public:
    /// Of a column that it is a part of.
    explicit FieldColumn(Column& column) : mColumn(column) {}
    FieldColumn(const FieldColumn&) = delete;
    FieldColumn& operator=(const FieldColumn&) = delete;

    /// The column's name alone once its table was deleted or its query is gone.
    platform::String Name() const override;
    platform::String Key() const override;
    bool Marker() const override;
    bool Selected() const override;
    void Selected(bool value) override;
    void activated(std::int16_t value) override;

    /// The column itself.
    const Column& column() const { return mColumn; }

private:
    Column& mColumn;
};

} // namespace zandor::model

#pragma once

#include <Zandor/model/Description.h>
#include <Zandor/model/FieldColumn.h>
#include <Zandor/model/Place.h>
#include <Zandor/model/export.h>

namespace zandor::model {

/// A column of a table in the query. Its key is unique in the whole query.
class ZANDOR_MODEL_EXPORT Column final : public TalvikZandorLib::ZDColumn {
public:
    /// The name of the entry that stands for all columns of its table.
    static constexpr platform::StringView allColumns = u"*";

    /// Query::addTable makes columns.
    Column(ColumnPlace place, ColumnDescription description)
        : mPlace(std::move(place)), mDescription(std::move(description)) {}

    String Name() const override { return mDescription.name; }
    String Key() const override { return mPlace.key(); }
    /// Whether the column belongs to the table's primary key.
    bool Marker() const override { return mDescription.primaryKey; }
    bool Selected() const override { return mSelected; }
    void Selected(bool value) override { mSelected = value; }
    void activated(std::int16_t value) override { mActivated = value; }

    /// What was set last: 1 while the user has the entry selected, 0 otherwise.
    std::int16_t activated() const { return mActivated; }
    /// As the database had it.
    const ColumnDescription& description() const { return mDescription; }
    /// How joins and definitions name it.
    const ColumnPlace& place() const { return mPlace; }
    /// The column as an output column shows it; always the same object.
    static Ref<FieldColumn> field(const Ref<Column>& column) {
        return column ? Ref<FieldColumn>(column, &column->mField) : Ref<FieldColumn>();
    }

private:
    const ColumnPlace mPlace;
    const ColumnDescription mDescription;
    bool mSelected = false;
    std::int16_t mActivated = 0;
    FieldColumn mField{*this};
};

} // namespace zandor::model

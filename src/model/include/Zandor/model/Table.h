#pragma once

#include <Zandor/model/Column.h>
#include <Zandor/model/Record.h>
#include <Zandor/model/export.h>

namespace zandor::model {

class Query;

/// What a table is made of, which only a saved query that is read again gets anew.
struct TableContents {
    platform::KeyedCollection<TalvikZandorLib::ZDColumn> columns = {}; ///< from the entry "*" on
    SavedQueryRef query = {}; ///< what the table is; nothing: one of the database
};

/// A database table, or a saved query, as it stands in the query: the same one may stand there
/// several times, each time under a name of its own. Its first column is the entry for all columns,
/// "*".
class ZANDOR_MODEL_EXPORT Table final : public TalvikZandorLib::ZDTable,
                                        public TalvikZandorLib::ActivatedColumns {
public:
    /// Query::addTable and Query::addQuery make tables.
    Table(TablePlace place, String name, String schema, String sourceName, TableContents contents);

    /// The name in the query, unique there: the source's, or one with a number behind it.
    String Name() const override { return mName; }
    String Key() const override { return mPlace.key(); }

    /// Twips. A new table has -1, -1, 0, 0: the control finds a place and a size.
    std::int32_t Left() const override { return mLeft; }
    std::int32_t Top() const override { return mTop; }
    std::int32_t Width() const override { return mWidth; }
    std::int32_t Height() const override { return mHeight; }
    /// Kept to the nearest twip, halves to even; error 6 outside 32 bits, nothing changes then.
    void Left(float value) override;
    void Top(float value) override;
    void Width(float value) override;
    void Height(float value) override;

    std::int16_t Selected() const override { return mSelected; }
    void Selected(std::int16_t value) override { mSelected = value; }
    TalvikZandorLib::Collection<TalvikZandorLib::ZDColumn>& Columns() override {
        return (*mContents)->columns;
    }
    /// Not the columns of a saved query: those change when it is read again.
    bool Activate(const std::vector<String>& keys) override;

    /// Name of the table or view in the database, or of the saved query.
    const String& sourceName() const { return mSourceName; }
    /// Of the table in the database; empty: the default one.
    const String& schema() const { return mSchema; }
    /// The saved query that it is; nothing for a table of the database.
    const SavedQueryRef& savedQuery() const { return (*mContents)->query; }
    /// Never nothing; another one once a saved query was read again.
    const std::shared_ptr<TableContents>& contents() const { return *mContents; }
    /// How joins name it.
    const TablePlace& place() const { return mPlace; }
    /// Raised by everything but selections.
    Revision& revision() { return mRevision; }
    /// The column with a key, or nothing.
    Ref<Column> column(const String& key) const;
    /// The column of exactly this name, else one whose name differs in case only, else nothing;
    /// never the entry "*".
    Ref<Column> columnNamed(platform::StringView name) const;
    /// Whether a column is the entry "*"; one that is really called so is not.
    bool isAllColumns(const Column& column) const;

private:
    friend class Query; ///< renames, for only the query knows which names are free

    const TablePlace mPlace;
    Revision mRevision;
    Revised<String> mName;
    const String mSchema;
    const String mSourceName;
    Revised<std::shared_ptr<TableContents>> mContents; ///< never nothing
    Revised<std::int32_t> mLeft{mRevision, -1};
    Revised<std::int32_t> mTop{mRevision, -1};
    Revised<std::int32_t> mWidth{mRevision};
    Revised<std::int32_t> mHeight{mRevision};
    std::int16_t mSelected = 0;
};

/// The table of a name as databases compare names, or nothing.
ZANDOR_MODEL_EXPORT Ref<Table>
tableNamed(const TalvikZandorLib::Collection<TalvikZandorLib::ZDTable>& tables,
           platform::StringView name);

} // namespace zandor::model

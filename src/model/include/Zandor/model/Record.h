#pragma once

#include <Zandor/model/Description.h>
#include <Zandor/model/Format.h>
#include <Zandor/model/Messages.h>
#include <Zandor/model/QueryOptions.h>
#include <Zandor/model/Total.h>
#include <Zandor/model/export.h>

#include <cstdint>
#include <memory>
#include <optional>

/// A query as plain values: everything that makes it the query it is, and no objects. Two queries
/// are the same when their records are equal. Which entries the user has selected in a list at the
/// moment (ZDColumn::activated) is the control's and not recorded.
namespace zandor::model {

struct SavedQuery;

/// A saved query that stands in another as a table, or nothing. It is shared and never changed, and
/// equal to one that holds the same.
class ZANDOR_MODEL_EXPORT SavedQueryRef {
public:
    SavedQueryRef() = default;
    SavedQueryRef(SavedQuery query); ///< of this one

    /// Whether there is one.
    explicit operator bool() const { return mQuery != nullptr; }
    const SavedQuery& operator*() const { return *mQuery; }       ///< there must be one
    const SavedQuery* operator->() const { return mQuery.get(); } ///< there must be one

    /// Whether both are nothing, or hold the same.
    ZANDOR_MODEL_EXPORT friend bool operator==(const SavedQueryRef&, const SavedQueryRef&);

private:
    std::shared_ptr<const SavedQuery> mQuery;
};

/// A column of a table.
struct ColumnRecord {
    String key = {};                    ///< "c" and a number
    ColumnDescription description = {}; ///< as the database had it
    bool selected = false;              ///< as ZDColumn::Selected

    friend bool operator==(const ColumnRecord&, const ColumnRecord&) = default;
};

/// A table as it stands in the query.
struct TableRecord {
    String key = {};                        ///< "t" and a number
    String name = {};                       ///< unique in the query
    String schema = {};                     ///< of the database's table; empty: the default one
    String sourceName = {};                 ///< of the database's table, or of the saved query
    std::int32_t left = -1;                 ///< as ZDTable::Left, in twips
    std::int32_t top = -1;                  ///< as ZDTable::Top
    std::int32_t width = 0;                 ///< as ZDTable::Width
    std::int32_t height = 0;                ///< as ZDTable::Height
    std::int16_t selected = 0;              ///< as ZDTable::Selected
    std::vector<ColumnRecord> columns = {}; ///< the first is the entry "*"
    SavedQueryRef query = {};               ///< what the table is; nothing: one of the database

    friend bool operator==(const TableRecord&, const TableRecord&) = default;
};

/// Keys of one end of a join. The column is empty when none is set, and so is the table when the
/// end reads as nothing.
struct EndRecord {
    String table = {};  ///< key
    String column = {}; ///< key

    friend bool operator==(const EndRecord&, const EndRecord&) = default;
};

/// A join.
struct JoinRecord {
    String key = {};             ///< "j" and a number
    EndRecord left = {};         ///< its left end
    EndRecord right = {};        ///< its right end
    std::int16_t type = 0;       ///< as ZDJoin::JoinType
    std::int16_t comparison = 0; ///< as ZDJoin::CompareOperator

    friend bool operator==(const JoinRecord&, const JoinRecord&) = default;
};

/// What a name in a criterion's text means (see criteria::Reference). The keys may be those of a
/// table that is gone; both are empty for what was no name of a column when it was typed.
struct NameRecord {
    std::int32_t begin = 0;    ///< as criteria::Reference::begin
    std::int32_t tableEnd = 0; ///< as criteria::Reference::tableEnd
    String table = {};         ///< key
    String column = {};        ///< key

    friend bool operator==(const NameRecord&, const NameRecord&) = default;
};

/// The criterion of one row.
struct CriterionRecord {
    std::int16_t row = 0;               ///< of the grid, 4 to 32767
    String text = {};                   ///< as it was typed
    std::vector<NameRecord> names = {}; ///< known by now, in the order of the text

    friend bool operator==(const CriterionRecord&, const CriterionRecord&) = default;
};

/// An output column.
struct DefinitionRecord {
    String key = {};            ///< "x" and a number
    String column = {};         ///< key; empty when the definition reads as having none
    String synonym = {};        ///< as ZDColumnDefinition::Synonym
    std::int16_t sortOrder = 0; ///< as ZDColumnDefinition::SortOrder
    bool visible = true;        ///< as ZDColumnDefinition::Visible
    std::int32_t width = 0;     ///< as SizedDefinition::Width
    std::vector<CriterionRecord> criteria = {}; ///< in the order of their rows
    Total total = Total::None;                  ///< as ColumnDefinition::total
    std::int16_t sortPriority = 0;              ///< as ColumnDefinition::sortPriority
    String expression = {};                     ///< as it was typed; then there is no column
    std::vector<NameRecord> names = {};         ///< of the expression, as those of a criterion
    Format format = Format::None;               ///< as ColumnDefinition::format
    std::int16_t decimals = asManyAsThereAre;   ///< as ColumnDefinition::decimals

    friend bool operator==(const DefinitionRecord&, const DefinitionRecord&) = default;
};

/// The number of the newest key of each kind, whether its object is still there or not.
struct LastKeys {
    std::int32_t table = 0;      ///< of a table; 0: none yet
    std::int32_t column = 0;     ///< of a column
    std::int32_t join = 0;       ///< of a join
    std::int32_t definition = 0; ///< of an output column

    friend bool operator==(const LastKeys&, const LastKeys&) = default;
};

/// A whole query.
struct QueryRecord {
    LastKeys lastKeys = {};                         ///< none of the keys below has a greater number
    QueryOptions options = {};                      ///< as Query::options
    std::vector<TableRecord> tables = {};           ///< in the order of the query
    std::vector<JoinRecord> joins = {};             ///< in the order of the query
    std::vector<DefinitionRecord> definitions = {}; ///< in the order of the query

    friend bool operator==(const QueryRecord&, const QueryRecord&) = default;
};

/// A query as it was read from its file. It stands in another by value, so that none can stand in
/// itself, and a file that is lost takes no query along.
struct SavedQuery {
    String file = {};        ///< where it came from, as the host names it; may be empty
    QueryRecord record = {}; ///< the query

    friend bool operator==(const SavedQuery&, const SavedQuery&) = default;
};

/// How deep saved queries stand in each other; a query without any is 0 deep.
inline constexpr int deepestSavedQuery = 8;
/// How deep they do in this one, at most.
ZANDOR_MODEL_EXPORT int depthOf(const QueryRecord& record);

/// Numbers of keys end here, so that a query made from a record has room for new ones.
inline constexpr std::int32_t greatestKeyNumber = 1'000'000'000;

/// The number of a key that is `letter` and a number from 1 to the greatest, or nothing: one number
/// has one key, without a leading zero.
ZANDOR_MODEL_EXPORT std::optional<std::int32_t> keyNumber(StringView key, char16_t letter);

/// Why a record is none of a query.
struct RecordFault {
    /// Names of the record's members and positions from 0: "tables/0/columns/3/key".
    std::string path;
    /// Its first argument is the place as a JSON pointer: "/tables/0/columns/3/key is used before
    /// already".
    Message message;
};

/// The first fault of a record, or nothing.
ZANDOR_MODEL_EXPORT std::optional<RecordFault> faultOf(const QueryRecord& record);

} // namespace zandor::model

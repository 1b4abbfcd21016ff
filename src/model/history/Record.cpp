#include <Zandor/model/Record.h>

#include <Zandor/model/Column.h>
#include <Zandor/model/ColumnDefinition.h>
#include <Zandor/model/Names.h>

#include <algorithm>
#include <unordered_map>
#include <unordered_set>

namespace zandor::model {

std::optional<std::int32_t> keyNumber(StringView key, char16_t letter) {
    constexpr std::size_t mostCharacters = 11;
    if (key.size() < 2 || key.size() > mostCharacters || key[0] != letter || key[1] == u'0')
        return {};
    std::int64_t number = 0;
    for (const char16_t c : key.substr(1)) {
        if (c < u'0' || c > u'9') return {};
        number = number * 10 + (c - u'0');
    }
    if (number > greatestKeyNumber) return {};
    return static_cast<std::int32_t>(number);
}

SavedQueryRef::SavedQueryRef(SavedQuery query)
    : mQuery(std::make_shared<const SavedQuery>(std::move(query))) {}

bool operator==(const SavedQueryRef& left, const SavedQueryRef& right) {
    if (left.mQuery == right.mQuery) return true;
    return left && right && *left == *right;
}

int depthOf(const QueryRecord& record) {
    int deepest = 0;
    for (const TableRecord& table : record.tables)
        if (table.query) deepest = std::max(deepest, depthOf(table.query->record) + 1);
    return deepest;
}

namespace {

std::string at(const char* list, std::size_t position) {
    return list + ('/' + std::to_string(position)) + '/';
}

/// Walks a record and keeps the first fault that it meets.
class Check {
public:
    /// `place` is where the record stands in another one.
    explicit Check(const QueryRecord& record, std::string place = {})
        : mRecord(record), mPlace(std::move(place)) {}

    std::optional<RecordFault> run() {
        lastKey("table", mRecord.lastKeys.table);
        lastKey("column", mRecord.lastKeys.column);
        lastKey("join", mRecord.lastKeys.join);
        lastKey("definition", mRecord.lastKeys.definition);
        if (mRecord.options.first < 0 || mRecord.options.first > QueryOptions::greatestFirst)
            fault<MessageCode::notInRange>("first", 0, QueryOptions::greatestFirst);
        if (!mRecord.options.hasPlacedComments())
            fault<MessageCode::notInRange>("comments", 0, static_cast<int>(CommentPlace::end));
        for (std::size_t n = 0; n < mRecord.tables.size() && !mFault; ++n)
            table(mRecord.tables[n], at("tables", n));
        for (std::size_t n = 0; n < mRecord.joins.size() && !mFault; ++n)
            join(mRecord.joins[n], at("joins", n));
        for (std::size_t n = 0; n < mRecord.definitions.size() && !mFault; ++n)
            definition(mRecord.definitions[n], at("definitions", n));
        return mFault;
    }

private:
    template <MessageCode code, class... Arguments>
    void fault(const std::string& path, const Arguments&... arguments) {
        if (mFault) return;
        const std::string whole = mPlace + path;
        mFault = RecordFault{whole, say<code>('/' + whole, arguments...)};
    }

    void lastKey(const char* kind, std::int32_t last) {
        if (last < 0 || last > greatestKeyNumber)
            fault<MessageCode::notInRange>(std::string("lastKeys/") + kind, 0, greatestKeyNumber);
    }

    /// One that was given, whether its object is still there or not.
    void given(const String& key, char16_t letter, std::int32_t last, const std::string& path) {
        const auto number = keyNumber(key, letter);
        if (!number)
            fault<MessageCode::notAKey>(path, StringView(&letter, 1), greatestKeyNumber);
        else if (*number > last)
            fault<MessageCode::keyNeverGiven>(path, last);
    }

    void key(const String& key, char16_t letter, std::int32_t last, const std::string& path) {
        given(key, letter, last, path);
        if (!mFault && !mKeys.insert(key).second) fault<MessageCode::keyUsedTwice>(path);
    }

    void table(const TableRecord& table, const std::string& path) {
        key(table.key, u't', mRecord.lastKeys.table, path + "key");
        if (table.name.empty()) fault<MessageCode::nameEmpty>(path + "name");
        if (table.sourceName.empty()) fault<MessageCode::nameEmpty>(path + "source/name");
        if (!mNames.insert(foldedName(table.name)).second)
            fault<MessageCode::nameOfTwoTables>(path + "name");
        if (table.columns.empty() || table.columns.front().description.name != Column::allColumns)
            fault<MessageCode::allColumnsMissing>(path + "columns");
        for (std::size_t n = 0; n < table.columns.size() && !mFault; ++n) {
            const ColumnRecord& column = table.columns[n];
            key(column.key, u'c', mRecord.lastKeys.column, path + at("columns", n) + "key");
            mTableOf.emplace(column.key, table.key);
        }
        if (table.query && !mFault)
            mFault = Check(table.query->record, mPlace + path + "source/query/").run();
    }

    void end(const EndRecord& end, const std::string& path) {
        if (!end.table.empty() && !(end.table.front() == u't' && mKeys.contains(end.table)))
            fault<MessageCode::keyOfNoTable>(path + "/table");
        if (end.column.empty()) return;
        const auto column = mTableOf.find(end.column);
        if (column == mTableOf.end() || column->second != end.table)
            fault<MessageCode::keyOfNoColumnThere>(path + "/column");
    }

    void join(const JoinRecord& join, const std::string& path) {
        key(join.key, u'j', mRecord.lastKeys.join, path + "key");
        end(join.left, path + "left");
        end(join.right, path + "right");
        if (join.type < 0 || join.type > 3) fault<MessageCode::noJoinType>(path + "type");
        if (join.comparison < 0 || join.comparison > 5)
            fault<MessageCode::noComparison>(path + "operator");
    }

    void definition(const DefinitionRecord& definition, const std::string& path) {
        key(definition.key, u'x', mRecord.lastKeys.definition, path + "key");
        if (!definition.column.empty() && !mTableOf.contains(definition.column))
            fault<MessageCode::keyOfNoColumn>(path + "column");
        if (definition.sortOrder < 0 || definition.sortOrder > 2)
            fault<MessageCode::noSortOrder>(path + "sort");
        if (definition.width < 0 || definition.width > ColumnDefinition::greatestWidth)
            fault<MessageCode::notInRange>(path + "width", 0, ColumnDefinition::greatestWidth);
        if (definition.sortPriority < 0 ||
            definition.sortPriority > ColumnDefinition::greatestSortPriority)
            fault<MessageCode::notInRange>(path + "sortPriority", 0,
                                           ColumnDefinition::greatestSortPriority);
        if (definition.total > lastTotal) fault<MessageCode::noTotal>(path + "total");
        if (definition.format > lastFormat) fault<MessageCode::noFormat>(path + "format");
        if (definition.decimals < asManyAsThereAre ||
            definition.decimals > ColumnDefinition::mostDecimals)
            fault<MessageCode::notInRange>(path + "decimals", asManyAsThereAre,
                                           ColumnDefinition::mostDecimals);
        if (!definition.expression.empty() && !definition.column.empty())
            fault<MessageCode::columnBesideExpression>(path + "column");
        names(definition.names, definition.expression, path);
        std::int32_t before = Criteria::firstRow - 1;
        for (std::size_t n = 0; n < definition.criteria.size() && !mFault; ++n) {
            const std::int16_t row = definition.criteria[n].row;
            if (row <= before && n == 0)
                fault<MessageCode::rowTooSmall>(path + at("criteria", n) + "row",
                                                Criteria::firstRow);
            else if (row <= before)
                fault<MessageCode::rowOutOfOrder>(path + at("criteria", n) + "row");
            before = row;
            names(definition.criteria[n].names, definition.criteria[n].text,
                  path + at("criteria", n));
        }
    }

    void names(const std::vector<NameRecord>& names, const String& text, const std::string& path) {
        std::int32_t end = 0;
        for (std::size_t n = 0; n < names.size() && !mFault; ++n) {
            const NameRecord& name = names[n];
            const std::string place = path + at("names", n);
            const bool inOrder = name.begin >= end && name.tableEnd >= name.begin;
            if (!inOrder || static_cast<std::size_t>(name.tableEnd) > text.size())
                fault<MessageCode::placeOutOfOrder>(place + "at");
            end = name.tableEnd;
            if (name.table.empty() && name.column.empty()) continue;
            given(name.table, u't', mRecord.lastKeys.table, place + "table");
            given(name.column, u'c', mRecord.lastKeys.column, place + "column");
            const auto column = mTableOf.find(name.column);
            const bool gone = column == mTableOf.end() && !mKeys.contains(name.table);
            if (!gone && (column == mTableOf.end() || column->second != name.table))
                fault<MessageCode::keyOfNoColumnThere>(place + "column");
        }
    }

    const QueryRecord& mRecord;
    const std::string mPlace;
    std::unordered_set<String> mKeys;
    std::unordered_set<String> mNames;
    std::unordered_map<String, String> mTableOf; ///< by the key of a column
    std::optional<RecordFault> mFault;
};

} // namespace

std::optional<RecordFault> faultOf(const QueryRecord& record) {
    if (depthOf(record) > deepestSavedQuery)
        return RecordFault{"tables",
                           say<MessageCode::savedQueriesTooDeep>("/tables", deepestSavedQuery)};
    return Check(record).run();
}

} // namespace zandor::model

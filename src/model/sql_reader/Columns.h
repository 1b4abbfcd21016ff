#pragma once

#include "model/sql_reader/Drawing.h"

#include "model/criteria/Parser.h"

#include <deque>
#include <functional>

namespace zandor::sql_reader {

/// The output columns of a query that is being drawn, by what comes out of them.
class Columns {
public:
    /// As a statement `written` for a drawing has them, those that leave no other trace in it too.
    Columns(Query& query, const Selected& selected, bool written);

    /// Those that come out, and those that rows are put together by.
    void addItems();
    /// Which of them sort, and in which order.
    void sort();

    /// What one item comes out of; `item` is counted from 0.
    const Ref<model::ColumnDefinition>& definitionOf(std::size_t item) const {
        return mItems[item];
    }

    /// Leaves out names under which columns come out by themselves.
    void dropOwnNames();

    /// What a cell of criteria belongs to.
    struct Column {
        model::criteria::Subject subject;
        Ref<model::ColumnDefinition> definition;
    };
    /// The columns that conditions on rows as they are stand under, made where there are none;
    /// those that only choose (`apart`) where rows are put together and they mean those before.
    std::vector<Column*> forConditions(const std::vector<Node>& subjects, bool apart);
    /// One of its own, behind another one or before all.
    Column& ownForCondition(const Node& subject, const Column* behind);
    /// All that it could stand under, as they follow each other in the grid.
    std::vector<Column*> knownFor(const Node& subject, bool apart);
    /// Counted from 0, with all columns of the grid.
    std::size_t placeOf(const Column& column) const;

    /// Rows are put together.
    bool isGrouped() const { return mGrouped; }

private:
    Column& add(const Node& subject, bool visible, const String& name = {});
    void addAllOf(const String& table);
    void fill(model::ColumnDefinition& definition, const Node& subject);
    void fillValue(model::ColumnDefinition& definition, const Node& value);
    std::vector<Column*> find(const Node& subject, bool apart);
    void addGroups();
    /// The columns of these subjects in their order: one that is not known is made, before the next
    /// of those behind it that is.
    std::vector<Column*> addInOrder(const std::vector<Node>& subjects,
                                    const std::function<std::vector<Column*>(const Node&)>& known,
                                    const std::function<Column&(const Node&)>& make);
    void moveNewestBefore(const Column& other);
    bool isNameless() const;
    Column& addForCondition(const Node& subject);

    Query& mQuery;
    const Selected& mSelected;
    const bool mWritten;
    bool mGrouped = false;
    bool mTotals = false; ///< some column has one
    std::vector<Ref<model::ColumnDefinition>> mItems;
    std::deque<Column> mColumns; ///< those with a value, in the order in which they were made
};

} // namespace zandor::sql_reader

#pragma once

#include "Scripted.h"

/// A query that is made of a host's own objects, which have nothing but IDispatch: two tables
/// "orders" and "customers", each with the columns "id" and "name".
class HostModel {
public:
    HostModel();

    IDispatch* query() const { return mQuery.get(); }
    Scripted& queryObject() const { return *mQuery.get(); }
    Scripted& table(std::size_t n) const { return *mTables->at(n).get(); }
    Scripted& column(std::size_t table, std::size_t n) const {
        return *mColumns[table]->at(n).get();
    }
    /// What was handed over to be stored.
    const std::vector<zandor::automation::Held<IDispatch>>& joins() const { return *mJoins; }

    /// A join from the first column of the one to the first of the other, stored.
    zandor::automation::Held<Scripted> join();
    /// An output column of the first table's second column, stored, with criteria in row 4.
    zandor::automation::Held<Scripted> definition();

private:
    template <class T>
    using List = std::shared_ptr<std::vector<zandor::automation::Held<T>>>;

    List<Scripted> mTables, mColumns[2];
    List<IDispatch> mJoins, mDefinitions;
    zandor::automation::Held<Scripted> mQuery;
};

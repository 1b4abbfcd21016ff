#include "HostModel.h"

#include "Late.h"

#include "frontends/windows/automation/com/Failure.h"

using namespace zandor;
using namespace zandor::automation;

namespace {

/// The key of an object of whatever kind.
platform::String keyOf(IDispatch* object) {
    return textOf(Late(Held<IDispatch>(object)).get(L"Key").value.bstrVal);
}

template <class T>
std::size_t placeOf(const std::vector<Held<T>>& items, const VARIANT& index) {
    if (index.vt == VT_BSTR) {
        for (std::size_t n = 0; n < items.size(); ++n)
            if (keyOf(items[n].get()) == textOf(index.bstrVal)) return n;
        throw Scripted::Failure{codeOf(5), u"Nobody has this key"};
    }
    const std::int32_t position = longOf(index);
    if (position < 1 || position > static_cast<std::int32_t>(items.size()))
        throw Scripted::Failure{codeOf(9), u"Nobody stands here"};
    return static_cast<std::size_t>(position) - 1;
}

/// A collection over a list that the host goes on to use.
template <class T>
Held<Scripted> collectionOf(const std::shared_ptr<std::vector<Held<T>>>& items) {
    auto collection = Scripted::make();
    collection->have(L"Count", [items](WORD, const Scripted::Arguments&) {
        return Value(static_cast<std::int32_t>(items->size()));
    });
    collection->have(L"Item", [items](WORD, const Scripted::Arguments& arguments) {
        return Value(Held<IDispatch>((*items)[placeOf(*items, *arguments.at(0))].get()));
    });
    collection->have(L"Remove", [items](WORD, const Scripted::Arguments& arguments) {
        const auto place = static_cast<std::ptrdiff_t>(placeOf(*items, *arguments.at(0)));
        items->erase(items->begin() + place);
        return Value();
    });
    return collection;
}

Held<Scripted> newColumn(const platform::String& table, const platform::String& name) {
    auto column = Scripted::make();
    column->haveText(L"Name", name);
    column->haveText(L"Key", table + u"." + name);
    column->haveFlag(L"Selected", false);
    column->haveNumber(L"activated", -1);
    return column;
}

/// Stores what is handed over, and answers with nothing.
Scripted::Member adderOf(const std::shared_ptr<std::vector<Held<IDispatch>>>& items,
                         char16_t letter) {
    return [items, letter](WORD, const Scripted::Arguments& arguments) {
        const Held<IDispatch> item = objectOf(*arguments.at(0));
        items->push_back(item);
        const platform::String key =
            letter + platform::decimal(static_cast<std::int64_t>(items->size()));
        Late(item).put(L"Key", platform::StringView(key));
        return Value();
    };
}

} // namespace

HostModel::HostModel()
    : mTables(std::make_shared<std::vector<Held<Scripted>>>()),
      mJoins(std::make_shared<std::vector<Held<IDispatch>>>()),
      mDefinitions(std::make_shared<std::vector<Held<IDispatch>>>()), mQuery(Scripted::make()) {
    std::size_t n = 0;
    for (const platform::String name : {u"orders", u"customers"}) {
        auto& columns = mColumns[n++];
        columns = std::make_shared<std::vector<Held<Scripted>>>();
        columns->push_back(newColumn(name, u"id"));
        columns->push_back(newColumn(name, u"name"));
        auto table = Scripted::make();
        table->haveText(L"Name", name);
        table->haveText(L"Key", u"t-" + name);
        for (const wchar_t* const place : {L"Left", L"Top", L"Width", L"Height"})
            table->haveNumber(place, 600);
        table->haveNumber(L"Selected", 0);
        table->haveObject(L"Columns", collectionOf(columns).get());
        mTables->push_back(table);
    }
    mQuery->haveObject(L"Tables", collectionOf(mTables).get());
    mQuery->haveObject(L"Joins", collectionOf(mJoins).get());
    mQuery->haveObject(L"ColumnDefinitions", collectionOf(mDefinitions).get());
    mQuery->have(L"AddJoin", adderOf(mJoins, u'j'));
    mQuery->have(L"AddColumnDefinition", adderOf(mDefinitions, u'x'));
    mQuery->have(L"DeleteTable", [tables = mTables](WORD, const Scripted::Arguments& arguments) {
        const Held<IDispatch> gone = objectOf(*arguments.at(0));
        std::erase_if(*tables, [&](const auto& table) { return table.get() == gone.get(); });
        return Value();
    });
}

Held<Scripted> HostModel::join() {
    auto join = Scripted::make();
    join->haveText(L"Key", u"j1");
    join->haveObject(L"LeftTable", &table(0));
    join->haveObject(L"LeftColumn", &column(0, 0));
    join->haveObject(L"RightTable", &table(1));
    join->haveObject(L"RightColumn", &column(1, 0));
    join->haveNumber(L"JoinType", 1);
    join->haveNumber(L"CompareOperator", 0);
    mJoins->push_back(Held<IDispatch>(join.get()));
    return join;
}

Held<Scripted> HostModel::definition() {
    const auto criteria = std::make_shared<std::vector<Held<Scripted>>>();
    auto criterium = Scripted::make();
    criterium->haveText(L"Criterium", u"> 5");
    criterium->haveText(L"Key", u"4");
    criteria->push_back(criterium);
    auto definition = Scripted::make();
    definition->haveText(L"Key", u"x1");
    definition->haveObject(L"Column", &column(0, 1));
    definition->haveText(L"Synonym", u"who");
    definition->haveNumber(L"SortOrder", 2);
    definition->haveFlag(L"Visible", true);
    definition->haveObject(L"Criteria", collectionOf(criteria).get());
    mDefinitions->push_back(Held<IDispatch>(definition.get()));
    return definition;
}

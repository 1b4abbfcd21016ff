#include "frontends/windows/automation/model/QueryObject.h"

#include "frontends/windows/automation/model/CollectionObject.h"

#include <Zandor/sql/Builder.h>

namespace zandor::automation {

namespace {

// The numbers of a type library are for good.
static_assert(zdSQLite == static_cast<int>(model::sql::Dialect::SQLite));
static_assert(zdStandard == static_cast<int>(model::sql::Dialect::Standard));

model::sql::Dialect dialectOf(ZDDialect number) {
    if (number < zdSQLite || number > zdStandard) throw platform::errors::invalidProcedureCall();
    return static_cast<model::sql::Dialect>(number);
}

/// Their words, as scripts take a list.
Value listOf(const model::Findings& findings) {
    Value list;
    list.parray = SafeArrayCreateVector(VT_VARIANT, 0, static_cast<ULONG>(findings.size()));
    if (!list.parray) throw std::bad_alloc();
    list.vt = VT_ARRAY | VT_VARIANT;
    LONG place = 0;
    for (const model::Finding& finding : findings) {
        Value text(finding.text());
        require(SafeArrayPutElement(list.parray, &place, &text));
        ++place;
    }
    return list;
}

} // namespace

model::Query& QueryObject::query() const { return dynamic_cast<model::Query&>(*object()); }

STDMETHODIMP QueryObject::get_Tables(IDispatch** value) {
    return answer([&] {
        give(value,
             collectionOf<TalvikZandorLib::ZDTable>(
                 object(), object()->Tables(), [query = object()](const platform::String& key) {
                     query->DeleteTable(query->Tables().Item(key));
                 }));
    });
}

STDMETHODIMP QueryObject::get_Joins(IDispatch** value) {
    return answer([&] { give(value, editableCollectionOf(object(), object()->Joins())); });
}

STDMETHODIMP QueryObject::get_ColumnDefinitions(IDispatch** value) {
    return answer(
        [&] { give(value, editableCollectionOf(object(), object()->ColumnDefinitions())); });
}

STDMETHODIMP QueryObject::AddJoin(IDispatch* Join, IDispatch** stored) {
    return answer([&] {
        IDispatch*& place = placeOf(stored);
        give(&place, object()->AddJoin(fromHost<TalvikZandorLib::ZDJoin>(Join)));
    });
}

STDMETHODIMP QueryObject::AddColumnDefinition(IDispatch* Definition, IDispatch** stored) {
    return answer([&] {
        IDispatch*& place = placeOf(stored);
        const auto given = fromHost<TalvikZandorLib::ZDColumnDefinition>(Definition);
        give(&place, object()->AddColumnDefinition(given));
    });
}

STDMETHODIMP QueryObject::DeleteTable(IDispatch* Table) {
    return answer([&] { object()->DeleteTable(fromHost<TalvikZandorLib::ZDTable>(Table)); });
}

STDMETHODIMP QueryObject::AddTable(IDispatch* Description, IDispatch** table) {
    return answer([&] {
        IDispatch*& place = placeOf(table);
        const auto description = ownObject<model::TableDescription>(Description);
        if (!description) throw platform::errors::typeMismatch();
        give(&place, platform::Ref<TalvikZandorLib::ZDTable>(query().addTable(*description)));
    });
}

STDMETHODIMP QueryObject::RenameTable(IDispatch* Table, BSTR Name) {
    return answer([&] {
        const auto table =
            std::dynamic_pointer_cast<model::Table>(ownObject<TalvikZandorLib::ZDTable>(Table));
        if (Table && !table) throw platform::errors::typeMismatch();
        query().renameTable(table, textOf(Name));
    });
}

STDMETHODIMP QueryObject::SQL(ZDDialect Dialect, BSTR* text) {
    return answer([&] {
        BSTR& place = placeOf(text);
        place = newText(
            model::sql::statementText(query(), dialectOf(Dialect), model::sql::ValueForm::literal)
                .text);
    });
}

STDMETHODIMP QueryObject::Findings(ZDDialect Dialect, VARIANT* texts) {
    return answer([&] {
        VARIANT& place = placeOf(texts);
        VariantInit(&place);
        listOf(model::sql::validate(query(), dialectOf(Dialect))).moveTo(place);
    });
}

STDMETHODIMP QueryObject::get_Distinct(VARIANT_BOOL* value) {
    return answer([&] { give(value, query().options().distinct); });
}

STDMETHODIMP QueryObject::put_Distinct(VARIANT_BOOL value) {
    return answer([&] {
        model::QueryOptions options = query().options();
        options.distinct = value != VARIANT_FALSE;
        query().options(std::move(options));
    });
}

STDMETHODIMP QueryObject::get_First(LONG* value) {
    return answer([&] { give(value, query().options().first); });
}

STDMETHODIMP QueryObject::put_First(LONG value) {
    return answer([&] {
        model::QueryOptions options = query().options();
        options.first = value;
        query().options(std::move(options));
    });
}

STDMETHODIMP QueryObject::get_Description(BSTR* value) {
    return answer([&] { give(value, query().options().description); });
}

STDMETHODIMP QueryObject::put_Description(BSTR value) {
    return answer([&] {
        model::QueryOptions options = query().options();
        options.description = textOf(value);
        query().options(std::move(options));
    });
}

} // namespace zandor::automation

#include "model/sql/PostgresTypes.h"

#include <algorithm>
#include <iterator>

namespace zandor::model::sql {

namespace {

// clang-format off
// Of the operators = and <> at least one.
constexpr StringView withoutEquality[] = {
    u"aclitem", u"box", u"cid", u"gtsvector", u"json", u"jsonpath", u"line", u"path",
    u"pg_brin_bloom_summary", u"pg_brin_minmax_multi_summary", u"pg_dependencies", u"pg_mcv_list",
    u"pg_ndistinct", u"pg_snapshot", u"point", u"polygon", u"refcursor", u"txid_snapshot", u"xml",
};
// clang-format on
constexpr StringView withoutOrder[] = {u"xid"};
// These compare their sizes, and a list of them cannot be compared at all.
constexpr StringView shapes[] = {u"circle", u"lseg"};

/// Between the name of a domain, or of a list of them, and of the type that it is made from.
constexpr StringView domainOf = u" AS ";
constexpr StringView listOf = u"[]";

template <std::size_t count>
bool isOneOf(const StringView (&names)[count], StringView name) {
    return std::find(std::begin(names), std::end(names), name) != std::end(names);
}

} // namespace

PostgresComparing postgresComparing(StringView declared) {
    // The operators of such types are none of a domain's; lists of domains have those of lists.
    if (const std::size_t at = declared.find(domainOf); at != StringView::npos) {
        if (!declared.substr(0, at).ends_with(listOf)) return {false, false};
        declared.remove_prefix(at + domainOf.size());
    }
    // A list of values can be compared as far as each of them can.
    const bool array = declared.ends_with(listOf);
    if (array) declared.remove_suffix(listOf.size());
    PostgresComparing comparing;
    comparing.equal = !isOneOf(withoutEquality, declared) && !(array && isOneOf(shapes, declared));
    comparing.ordered = comparing.equal && !isOneOf(withoutOrder, declared);
    using Numbers = PostgresComparing::Numbers;
    if (declared.empty()) comparing.numbers = Numbers::any;
    if (declared == u"oid" && !array) comparing.numbers = Numbers::whole;
    if (declared == u"jsonb" && !array) comparing.numbers = Numbers::written;
    return comparing;
}

} // namespace zandor::model::sql

#include "model/sql_reader/Tree.h"

#include "model/sql_reader/Refused.h"

#include <algorithm>
#include <array>
#include <optional>

namespace zandor::sql_reader {

namespace {

/// The least place in a node and what is below it.
std::optional<std::size_t> placeOf(const nlohmann::json& json) {
    std::optional<std::size_t> least;
    const auto take = [&](std::optional<std::size_t> place) {
        if (place && (!least || *place < *least)) least = place;
    };
    if (json.is_object()) {
        const auto own = json.find("location");
        if (own != json.end() && own->is_number_integer() && own->get<std::int64_t>() >= 0)
            take(own->get<std::size_t>());
    }
    if (json.is_structured())
        for (const auto& below : json) take(placeOf(below));
    return least;
}

} // namespace

Tree::Tree(const Json& node) : mNode(&node), mParts(&node) {
    if (!node.is_object() || node.size() != 1) return;
    mKind = node.begin().key();
    mParts = &node.begin().value();
}

std::string_view Tree::sqlNameOf(std::string_view kind) {
    using Pair = std::pair<std::string_view, std::string_view>;
    static constexpr auto names = std::to_array<Pair>({
        {"A_ArrayExpr", "ARRAY"},
        {"A_Indirection", "[ ]"},
        {"agg_filter", "FILTER"},
        {"agg_order", "ORDER BY"},
        {"agg_within_group", "WITHIN GROUP"},
        {"BooleanTest", "IS TRUE"},
        {"CollateClause", "COLLATE"},
        {"groupDistinct", "GROUP BY DISTINCT"},
        {"intoClause", "INTO"},
        {"MinMaxExpr", "GREATEST"},
        {"NamedArgExpr", "=>"},
        {"RangeTableSample", "TABLESAMPLE"},
        {"RowExpr", "(a, b)"},
        {"SQLValueFunction", "CURRENT_USER"},
        {"valuesLists", "VALUES"},
    });
    const auto at = std::find_if(names.begin(), names.end(),
                                 [&](const Pair& pair) { return pair.first == kind; });
    return at == names.end() ? kind : at->second;
}

const Tree& Tree::only(std::initializer_list<std::string_view> names) const {
    for (const auto& [name, value] : mParts->items()) {
        if (name == "location" || name == "stmt_len") continue;
        if (std::find(names.begin(), names.end(), name) == names.end())
            refuse<MessageCode::noPlaceFor>(place(), model::say<MessageCode::thisPart>(sqlNameOf(name)));
    }
    return *this;
}

std::vector<Tree> Tree::list(const char* name) const {
    std::vector<Tree> all;
    const auto found = mParts->find(name);
    if (found == mParts->end()) return all;
    for (const Json& each : *found) all.emplace_back(each);
    return all;
}

platform::String Tree::text(const char* name) const { return platform::fromUtf8(word(name)); }

std::string_view Tree::word(const char* name) const {
    const auto found = mParts->find(name);
    if (found == mParts->end() || !found->is_string()) return {};
    return found->get_ref<const std::string&>();
}

std::vector<platform::String> Tree::names(const char* name) const {
    std::vector<platform::String> all;
    for (const Tree& each : list(name)) all.push_back(each.text("sval"));
    return all;
}

std::size_t Tree::place() const { return placeOf(*mParts).value_or(0); }

} // namespace zandor::sql_reader

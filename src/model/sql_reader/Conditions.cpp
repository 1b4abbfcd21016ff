#include "model/sql_reader/Conditions.h"

#include "model/criteria/Literals.h"
#include "model/sql_reader/Refused.h"

#include <algorithm>
#include <map>
#include <optional>

namespace zandor::sql_reader {

using model::ColumnType;
using platform::String;
using platform::StringView;

namespace {

bool isGiven(const Node& node) {
    return std::holds_alternative<model::sql::Value>(node->node) ||
           std::holds_alternative<model::sql::Parameter>(node->node);
}

/// How often each text is there.
using Counts = std::map<String, std::ptrdiff_t>;

std::ptrdiff_t countIn(const Counts& counts, const String& text) {
    const auto found = counts.find(text);
    return found == counts.end() ? 0 : found->second;
}

Counts countsOf(const std::vector<String>& texts) {
    Counts counts;
    for (const String& text : texts) ++counts[text];
    return counts;
}

/// Of what `key` has for the values in a node.
template <typename Key>
void addValues(Counts& counts, const model::sql::Expression& node, const Key& key) {
    if (const auto* value = std::get_if<model::sql::Value>(&node.node))
        if (const std::optional<String> counted = key(*value)) ++counts[*counted];
    for (const Node& part : model::sql::partsOf(node)) addValues(counts, *part, key);
}

/// What a text comes to as a number, or as truth, for which a number stands too.
std::optional<String> numberIn(StringView text) {
    while (text.starts_with(u'(')) text = text.substr(1, text.size() - 2);
    if (const auto truth = model::criteria::literal(text, ColumnType::Boolean))
        return truth->text == u"true" ? u"1" : u"0";
    const auto number = model::criteria::literal(text, ColumnType::Decimal);
    return number ? std::optional(number->text) : std::nullopt;
}

bool isMoment(ColumnType type) {
    return type == ColumnType::Date || type == ColumnType::Time || type == ColumnType::Timestamp;
}

void checkDates(const Node& node, const std::vector<Node>& dates, std::size_t place) {
    const auto* call = std::get_if<model::sql::Call>(&node->node);
    if (call && call->function == model::sql::Function::moment) {
        const Node& date = call->arguments.front();
        if (std::none_of(dates.begin(), dates.end(),
                         [&](const Node& each) { return model::sql::same(each, date); }))
            refuse<MessageCode::momentOfDate>(place);
    }
    for (const Node& part : model::sql::partsOf(*node)) checkDates(part, dates, place);
}

} // namespace

Node asCondition(const Node& node) {
    namespace sql = model::sql;
    const bool joint = std::holds_alternative<sql::And>(node->node) ||
                       std::holds_alternative<sql::Or>(node->node) ||
                       std::holds_alternative<sql::Not>(node->node);
    if (joint) {
        auto parts = sql::partsOf(*node);
        for (Node& part : parts) part = asCondition(part);
        return sql::withParts(*node, std::move(parts));
    }
    if (const auto* compare = std::get_if<sql::Compare>(&node->node))
        if (isGiven(compare->left) && !isGiven(compare->right))
            return sql::make(
                sql::Compare{sql::mirrored(compare->comparison), compare->right, compare->left});
    if (sql::isCondition(*node)) return node;
    return sql::make(sql::Compare{sql::Comparison::equal, node,
                                  sql::make(sql::Value{ColumnType::Boolean, u"true"})});
}

bool asksForTruth(const Node& node) {
    namespace sql = model::sql;
    const auto isTruth = [](const Node& part) {
        return sql::isCondition(*part) || sql::typeOf(*part) == ColumnType::Boolean;
    };
    const auto parts = sql::partsOf(*node);
    const bool joint = std::holds_alternative<sql::And>(node->node) ||
                       std::holds_alternative<sql::Or>(node->node) ||
                       std::holds_alternative<sql::Not>(node->node);
    if (joint && !std::all_of(parts.begin(), parts.end(), isTruth)) return false;
    const auto* choice = std::get_if<sql::Choice>(&node->node);
    if (choice && !isTruth(choice->condition)) return false;
    return std::all_of(parts.begin(), parts.end(), asksForTruth);
}

void checkMoments(const Node& node, const std::vector<String>& texts,
                  const std::vector<Node>& dates, std::size_t place) {
    checkDates(node, dates, place);
    const Counts typed = countsOf(texts);
    Counts moments;
    addValues(moments, *node, [](const model::sql::Value& value) {
        return isMoment(value.type) ? std::optional(value.text) : std::nullopt;
    });
    for (const auto& [text, count] : moments)
        if (countIn(typed, text) == 0) refuse<MessageCode::momentWritten>(place, text);
    // One that is typed so may be a text there, and another the moment.
    Counts all;
    addValues(all, *node, [](const model::sql::Value& value) { return std::optional(value.text); });
    for (const String& text : texts)
        for (const ColumnType type : {ColumnType::Date, ColumnType::Time, ColumnType::Timestamp}) {
            const auto value = model::criteria::literal(text, type);
            if (value && value->text != text && moments.contains(value->text) &&
                countIn(all, value->text) > countIn(typed, value->text))
                refuse<MessageCode::momentWritten>(place, value->text);
        }
}

void checkTexts(const Node& node, const std::vector<String>& texts,
                const std::vector<String>& others, std::size_t place) {
    Counts values;
    addValues(values, *node, [](const model::sql::Value& value) {
        return value.type == ColumnType::Text ? std::nullopt : numberIn(value.text);
    });
    Counts typed;
    for (const String& other : others)
        if (const auto number = numberIn(other)) ++typed[*number];
    for (const String& text : texts)
        if (const auto number = numberIn(text);
            number && countIn(values, *number) > countIn(typed, *number))
            refuse<MessageCode::textConverted>(place, text);
}

bool holdsAlways(const Node& node) {
    const auto* compare = std::get_if<model::sql::Compare>(&node->node);
    return compare && compare->comparison == model::sql::Comparison::equal &&
           std::holds_alternative<model::sql::Value>(compare->left->node) &&
           model::sql::same(compare->left, compare->right);
}

} // namespace zandor::sql_reader

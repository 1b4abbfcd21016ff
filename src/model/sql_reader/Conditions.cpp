#include "model/sql_reader/Conditions.h"

#include "model/criteria/Literals.h"
#include "model/sql_reader/Refused.h"

#include <algorithm>

namespace zandor::sql_reader {

using model::ColumnType;
using platform::String;
using platform::StringView;

namespace {

bool isGiven(const Node& node) {
    return std::holds_alternative<model::sql::Value>(node->node) ||
           std::holds_alternative<model::sql::Parameter>(node->node);
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

/// How often a value that is no text is there.
std::ptrdiff_t countOf(const model::sql::Expression& node, StringView text) {
    const auto* value = std::get_if<model::sql::Value>(&node.node);
    std::ptrdiff_t count = value && value->type != ColumnType::Text && value->text == text ? 1 : 0;
    for (const Node& part : model::sql::partsOf(node)) count += countOf(*part, text);
    return count;
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
    if (const auto* value = std::get_if<model::sql::Value>(&node->node)) {
        const bool moment = value->type == ColumnType::Date || value->type == ColumnType::Time ||
                            value->type == ColumnType::Timestamp;
        if (moment && std::find(texts.begin(), texts.end(), value->text) == texts.end())
            refuse<MessageCode::momentWritten>(place, value->text);
    }
    const auto* call = std::get_if<model::sql::Call>(&node->node);
    if (call && call->function == model::sql::Function::moment) {
        const Node& date = call->arguments.front();
        if (std::none_of(dates.begin(), dates.end(),
                         [&](const Node& each) { return model::sql::same(each, date); }))
            refuse<MessageCode::momentOfDate>(place);
    }
    for (const Node& part : model::sql::partsOf(*node)) checkMoments(part, texts, dates, place);
}

void checkTexts(const Node& node, const std::vector<String>& texts,
                const std::vector<String>& others, std::size_t place) {
    const auto bare = [](StringView text) {
        while (text.starts_with(u'(')) text = text.substr(1, text.size() - 2);
        return text;
    };
    for (const String& text : texts)
        for (const ColumnType type : {ColumnType::Decimal, ColumnType::Boolean}) {
            const auto value = model::criteria::literal(text, type);
            if (!value) continue;
            const auto same = [&](const String& other) {
                const auto its = model::criteria::literal(bare(other), type);
                return its && its->text == value->text;
            };
            if (countOf(*node, value->text) > std::count_if(others.begin(), others.end(), same))
                refuse<MessageCode::textConverted>(place, text);
        }
}

bool holdsAlways(const Node& node) {
    const auto* compare = std::get_if<model::sql::Compare>(&node->node);
    return compare && compare->comparison == model::sql::Comparison::equal &&
           std::holds_alternative<model::sql::Value>(compare->left->node) &&
           model::sql::same(compare->left, compare->right);
}

} // namespace zandor::sql_reader

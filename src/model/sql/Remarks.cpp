#include "model/sql/Remarks.h"

#include <algorithm>

namespace zandor::model::sql {

namespace {

std::vector<String> linesOf(StringView text) {
    std::vector<String> lines{{}};
    for (const char16_t c : text) {
        if (c == u'\n')
            lines.emplace_back();
        else if (c != u'\r')
            lines.back() += isBlankInComment(c) ? u' ' : c;
    }
    for (String& line : lines) line.erase(line.find_last_not_of(u' ') + 1);
    return lines;
}

String comment(StringView line) {
    return line.empty() ? String(u"--") : u"-- " + String(line);
}

bool contains(const Node& whole, const Node& part) {
    if (same(whole, part)) return true;
    const auto parts = partsOf(*whole);
    return std::any_of(parts.begin(), parts.end(),
                       [&](const Node& each) { return contains(each, part); });
}

} // namespace

Remarks::Remarks(const Statement& statement, bool shown) {
    if (shown) mRemarks = statement.remarks;
}

Remarks::Lines Remarks::taken(const auto& isMeant) {
    Lines lines;
    for (const Remark& remark : mRemarks) {
        if (!isMeant(remark)) continue;
        for (const String& line : linesOf(remark.text)) {
            if (!remark.beside)
                lines.above.push_back(comment(line));
            else if (lines.beside.empty())
                lines.beside = u' ' + comment(line);
            else
                lines.beside += u' ' + line;
        }
    }
    mRemarks.erase(std::remove_if(mRemarks.begin(), mRemarks.end(), isMeant), mRemarks.end());
    return lines;
}

Remarks::Lines Remarks::of(const decltype(Remark::by)& by) {
    return taken([&](const Remark& remark) { return remark.by == by; });
}

Remarks::Lines Remarks::within(const Node& condition) {
    return taken([&](const Remark& remark) {
        const auto* node = std::get_if<Node>(&remark.by);
        if (!node) return false;
        // What one cell asks for may stand as several conditions.
        const auto* all = std::get_if<And>(&(*node)->node);
        return contains(condition, *node) ||
               (all && std::any_of(all->terms.begin(), all->terms.end(),
                                   [&](const Node& term) { return same(condition, term); }));
    });
}

Remarks::Lines Remarks::ofOtherConditions() {
    return taken([](const Remark& remark) { return std::holds_alternative<Node>(remark.by); });
}

Remarks::Lines Remarks::rest() {
    return taken([](const Remark&) { return true; });
}

} // namespace zandor::model::sql

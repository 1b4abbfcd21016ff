#pragma once

#include <Zandor/sql/Statement.h>

#include <vector>

namespace zandor::model::sql {

/// Whether a character would end a comment for somebody, or cannot be seen in it.
inline bool isBlankInComment(char16_t c) {
    return c <= u' ' || c == 0x7F || c == 0x85 || c == 0x2028 || c == 0x2029;
}

/// The comments of a statement, handed out once each.
class Remarks {
public:
    /// Nothing where they are not `shown`.
    Remarks(const Statement& statement, bool shown);

    /// What stands by one part, as comments of SQL.
    struct Lines {
        std::vector<String> above; ///< each a line of its own
        String beside;             ///< begins with a blank; may be empty
    };

    /// By a clause, an item or a source.
    Lines of(const decltype(Remark::by)& by);
    /// By a condition within one.
    Lines within(const Node& condition);
    /// By conditions, and not within those that were asked for.
    Lines ofOtherConditions();
    /// All others.
    Lines rest();

private:
    Lines taken(const auto& isMeant);

    std::vector<Remark> mRemarks;
};

} // namespace zandor::model::sql

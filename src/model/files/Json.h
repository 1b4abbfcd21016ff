#pragma once

#include <string>
#include <string_view>
#include <variant>
#include <vector>

/// JSON as a tree that loses nothing: members keep their order, numbers their digits.
namespace zandor::files::json {

struct Value;
struct Member;
using Items = std::vector<Value>;
using Members = std::vector<Member>;

struct Null {};

struct Number {
    std::string text; ///< in the grammar of JSON
};

struct Value {
    std::variant<Null, bool, Number, std::string, Items, Members> content;
};

struct Member {
    std::string name;
    Value value;
};

/// The member of a name, or nothing.
Value* find(Members& members, std::string_view name);

Value number(std::int64_t value);

/// Lines of 100 characters where a break allows it, two blanks of indentation a level. Texts are
/// written as they stand, in UTF-8. Ends with a line end.
std::string print(const Value& value);

} // namespace zandor::files::json

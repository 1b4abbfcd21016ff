#include "model/files/Json.h"

#include <nlohmann/json.hpp>

#include <algorithm>

namespace zandor::files::json {

namespace {

template <class... Ts>
struct Overloaded : Ts... {
    using Ts::operator()...;
};
template <class... Ts>
Overloaded(Ts...) -> Overloaded<Ts...>;

/// Most texts have nothing that is written otherwise than it is.
std::string quoted(const std::string& text) {
    const bool plain = std::ranges::all_of(
        text, [](char c) { return c >= ' ' && c < '\x7f' && c != '"' && c != '\\'; });
    return plain ? '"' + text + '"' : nlohmann::json(text).dump();
}

/// Writes a value in one line up to `limit` characters; false when it needs more.
bool printLine(const Value& value, std::string& out, std::size_t limit) {
    const auto add = [&](std::string_view text) {
        out += text;
        return out.size() <= limit;
    };
    return std::visit(Overloaded{[&](Null) { return add("null"); },
                                 [&](bool flag) { return add(flag ? "true" : "false"); },
                                 [&](const Number& number) { return add(number.text); },
                                 [&](const std::string& text) {
                                     return text.size() <= limit && add(quoted(text));
                                 },
                                 [&](const Items& items) {
                                     if (items.empty()) return add("[]");
                                     add("[");
                                     for (const Value& item : items) {
                                         if (&item != &items.front()) add(", ");
                                         if (!printLine(item, out, limit)) return false;
                                     }
                                     return add("]");
                                 },
                                 [&](const Members& members) {
                                     if (members.empty()) return add("{}");
                                     add("{");
                                     for (const Member& member : members) {
                                         if (&member != &members.front()) add(", ");
                                         if (!add(quoted(member.name)) || !add(": ")) return false;
                                         if (!printLine(member.value, out, limit)) return false;
                                     }
                                     return add("}");
                                 }},
                      value.content);
}

/// `used` characters stand in the line already.
void printBroken(const Value& value, std::string& out, std::size_t level, std::size_t used) {
    constexpr std::size_t lineLength = 100;
    constexpr std::size_t perLevel = 2;
    std::string line;
    if (printLine(value, line, lineLength - std::min(lineLength, used + 1))) {
        out += line;
        return;
    }
    const std::string indentation(perLevel * (level + 1), ' ');
    const auto begin = [&](char bracket, bool first) {
        out += first ? std::string(1, bracket) + '\n' : ",\n";
        out += indentation;
    };
    const auto end = [&](char bracket) {
        out += '\n' + std::string(perLevel * level, ' ') + bracket;
    };
    const auto whole = [&] {
        line.clear();
        printLine(value, line, std::string::npos);
        out += line;
    };
    std::visit(Overloaded{[&](const Items& items) {
                              if (items.empty()) return whole();
                              for (const Value& item : items) {
                                  begin('[', &item == &items.front());
                                  printBroken(item, out, level + 1, indentation.size());
                              }
                              end(']');
                          },
                          [&](const Members& members) {
                              if (members.empty()) return whole();
                              for (const Member& member : members) {
                                  begin('{', &member == &members.front());
                                  const std::string name = quoted(member.name) + ": ";
                                  out += name;
                                  printBroken(member.value, out, level + 1,
                                              indentation.size() + name.size());
                              }
                              end('}');
                          },
                          [&](const auto&) { whole(); }},
               value.content);
}

} // namespace

Value* find(Members& members, std::string_view name) {
    for (Member& member : members)
        if (member.name == name) return &member.value;
    return nullptr;
}

Value number(std::int64_t value) { return {Number{std::to_string(value)}}; }

std::string print(const Value& value) {
    std::string text;
    printBroken(value, text, 0, 0);
    text += '\n';
    return text;
}

} // namespace zandor::files::json

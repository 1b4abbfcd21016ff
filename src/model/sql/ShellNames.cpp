#include "model/sql/ShellNames.h"

#include "model/sql/BareNames.h"

#include <Zandor/model/Names.h>

#include <algorithm>

namespace zandor::model::sql {

namespace {

bool isFigure(char16_t c) { return c >= u'0' && c <= u'9'; }

/// A name in letters, digits and single `_`.
String simplified(StringView name) {
    String out;
    for (const char16_t c : name) {
        if (isLetter(c) || isFigure(c))
            out += c;
        else if (!out.empty() && out.back() != u'_')
            out += u'_';
    }
    while (!out.empty() && out.back() == u'_') out.pop_back();
    if (out.empty()) return u"parameter";
    return isFigure(out.front()) ? u"parameter_" + out : out;
}

bool isSimple(StringView name) {
    return !name.empty() && !isFigure(name.front()) &&
           std::all_of(name.begin(), name.end(),
                       [](char16_t c) { return isLetter(c) || isFigure(c) || c == u'_'; });
}

/// What stands for `?` in a dialect's placeholder.
String inPlaceOfMark(String placeholder, StringView text) {
    return placeholder.replace(placeholder.find(u'?'), 1, text);
}

} // namespace

ShellNames::ShellNames(const std::vector<Binding>& bindings) {
    for (const bool simple : {true, false})
        for (const Binding& binding : bindings)
            if (const auto* parameter = std::get_if<Parameter>(&binding))
                if (isSimple(parameter->name) == simple && !mNames.contains(parameter->name))
                    add(parameter->name, simple ? parameter->name : simplified(parameter->name));
}

void ShellNames::add(const String& name, const String& wanted) {
    const auto isTaken = [this](const String& candidate) {
        return std::any_of(mNames.begin(), mNames.end(),
                           [&](const auto& other) { return sameName(other.second, candidate); });
    };
    String free = wanted;
    for (int n = 2; isTaken(free); ++n) free = wanted + u'_' + platform::decimal(n);
    mNames.emplace(name, std::move(free));
}

String ShellNames::placeholder(const String& parameter, ColumnType type, Dialect dialect) const {
    const String& name = mNames.at(parameter);
    switch (dialect) {
    case Dialect::MySQL:
    case Dialect::SqlServer: return u'@' + name;
    case Dialect::PostgreSQL: // which puts in a text
        return inPlaceOfMark(sql::placeholder(type, dialect), u":'" + name + u"'");
    case Dialect::SQLite:
    case Dialect::Standard: break;
    }
    return u':' + name;
}

} // namespace zandor::model::sql

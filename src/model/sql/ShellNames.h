#pragma once

#include <Zandor/sql/Printer.h>

#include <map>

namespace zandor::model::sql {

/// The names that a statement's parameters have in an engine's own shell, which takes letters,
/// digits and `_` only: no two are the same, also where the shell takes no notice of case. A name
/// that is one already stays.
class ShellNames {
public:
    ShellNames() = default;
    explicit ShellNames(const std::vector<Binding>& bindings);

    /// A parameter as the shell of a dialect puts its value in: `:name`, `@name`, or with the type
    /// that it has where the shell puts in a text.
    String placeholder(const String& parameter, ColumnType type, Dialect dialect) const;

private:
    void add(const String& name, const String& wanted);

    std::map<String, String> mNames; ///< by the parameter's
};

} // namespace zandor::model::sql

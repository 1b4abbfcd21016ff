#pragma once

#include <nlohmann/json.hpp>

#include <Zandor/platform/String.h>

#include <initializer_list>
#include <string_view>

namespace zandor::sql_reader {

/// A node of the parser's tree. What a node has that nobody asked for must not be lost without a
/// word: who reads a node says by `only` which parts of it there may be.
class Tree {
public:
    using Json = nlohmann::json;

    /// Of {"Kind": {parts}}; the JSON must outlive it.
    explicit Tree(const Json& node);
    /// Of the parts alone, where the place says what kind it is.
    static Tree ofParts(const Json& parts) { return {{}, parts}; }

    std::string_view kind() const { return mKind; }
    /// What people call it, for messages.
    std::string_view sqlName() const { return sqlNameOf(mKind); }
    bool is(std::string_view kind) const { return mKind == kind; }

    static std::string_view sqlNameOf(std::string_view kind);

    /// Refuses parts of other names.
    const Tree& only(std::initializer_list<std::string_view> names) const;

    bool has(const char* name) const { return mParts->contains(name); }
    /// There must be such a node.
    Tree node(const char* name) const { return Tree(mParts->at(name)); }
    /// The same where the place says what kind it is.
    Tree part(const char* name) const { return ofParts(mParts->at(name)); }
    /// None where there is none.
    std::vector<Tree> list(const char* name) const;
    /// Empty where there is none.
    platform::String text(const char* name) const;
    std::string_view word(const char* name) const;
    bool flag(const char* name) const { return mParts->value(name, false); }
    std::int64_t number(const char* name) const { return mParts->value(name, std::int64_t(0)); }
    /// The texts of a list of names.
    std::vector<platform::String> names(const char* name) const;

    /// In bytes of what was parsed: of the first token that is known to belong to it.
    std::size_t place() const;

    /// The whole node, for who compares it.
    const Json& json() const { return *mNode; }

private:
    Tree(std::string_view kind, const Json& parts) : mKind(kind), mNode(&parts), mParts(&parts) {}

    std::string_view mKind;
    const Json* mNode;
    const Json* mParts;
};

} // namespace zandor::sql_reader

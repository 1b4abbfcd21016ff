#pragma once

#include "frontends/windows/automation/com/Held.h"
#include "frontends/windows/automation/keeping/State.h"

#include <optional>
#include <vector>

namespace zandor::automation {

/// The kept members of one or several controls as texts, a row each, and what a user wants them to
/// be. The controls are asked late-bound, for they may stand anywhere.
class PageValues {
public:
    /// Why nothing, or not everything, was written.
    struct Refusal {
        std::size_t row;
        platform::String words;
    };

    /// Reads them; what was wanted is forgotten. A RuntimeError where one cannot be read: there are
    /// none then.
    void setObjects(std::vector<Held<IDispatch>> objects);
    bool hasObjects() const { return !mObjects.empty(); }

    std::size_t size() const { return keptMembers().size(); }
    platform::StringView name(std::size_t row) const { return keptMembers()[row]->name; }
    /// Whether it is "True" or "False".
    bool isFlag(std::size_t row) const;
    /// What is wanted, or else what all have; empty where they differ.
    platform::String text(std::size_t row) const;
    void want(std::size_t row, const platform::String& text);
    bool isDirty() const;
    /// The row of a member; nothing: it is not kept.
    static std::optional<std::size_t> rowOf(DISPID member);

    /// Writes what is wanted to all of them and reads them again. A value that a member cannot have
    /// is refused before anything is written; where a control refuses one, those before it are
    /// written.
    std::optional<Refusal> apply();

private:
    void read();

    std::vector<Held<IDispatch>> mObjects;
    std::vector<State> mStates; ///< one of each object
    std::vector<std::optional<platform::String>> mWanted{keptMembers().size()};
};

} // namespace zandor::automation

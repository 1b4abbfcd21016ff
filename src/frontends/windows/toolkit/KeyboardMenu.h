#pragma once

#include "frontends/windows/toolkit/system.h"

#include <Zandor/platform/String.h>

#include <functional>
#include <memory>
#include <optional>
#include <utility>

namespace zandor::platform::windows {

/// Names of the menu entries that have a key of their own.
namespace menuentry {
inline constexpr StringView showJoin = u"mnuJoinShowDefinition";
inline constexpr StringView deleteJoin = u"mnuJoinDelete";
inline constexpr StringView deleteTable = u"mnuTableDefinitionDelete";
inline constexpr StringView deleteColumn = u"mnuColumnDefinitionDelete";
} // namespace menuentry

/// How the control's menu opens when it is a key that asks for it. The key acts through the gesture
/// that opens the menu for the mouse, so that the control prepares the entries in the same way.
class KeyboardMenu {
public:
    struct Request {
        std::optional<POINT> at; ///< on the screen; none: at the mouse
        StringView entry;        ///< chosen without showing the menu; empty: the user chooses
    };
    using Gesture = std::function<void()>;

    void openAt(POINT at, const Gesture& gesture) { run({at, {}}, gesture); }

    /// Chooses an entry, unless it is disabled or hidden.
    void choose(StringView entry, const Gesture& gesture) { run({{}, entry}, gesture); }

    /// For the menu as it opens. A request holds for one opening.
    Request take() { return std::exchange(*mRequest, {}); }

private:
    void run(const Request& request, const Gesture& gesture) {
        // Held, because the gesture may end the control.
        const std::shared_ptr<Request> held = mRequest;
        *held = request;
        gesture();
        *held = {};
    }

    std::shared_ptr<Request> mRequest = std::make_shared<Request>();
};

} // namespace zandor::platform::windows

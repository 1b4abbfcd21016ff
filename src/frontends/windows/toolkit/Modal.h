#pragma once

#include "frontends/windows/toolkit/Surroundings.h"

#include <utility>

namespace zandor::platform::windows {

/// A box, a dialog or a menu stands open, or is about to; the host hears of it, and again when this
/// goes. It may end the control as it hears it.
class Modal {
public:
    explicit Modal(const Surroundings& around) {
        if (const auto begins = around.onModal) mEnds = begins();
    }
    Modal(const Modal&) = delete;
    Modal& operator=(const Modal&) = delete;
    ~Modal() {
        if (mEnds) mEnds();
    }

private:
    std::function<void()> mEnds;
};

} // namespace zandor::platform::windows

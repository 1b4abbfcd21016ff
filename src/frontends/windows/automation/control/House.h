#pragma once

#include "frontends/windows/automation/com/Module.h"
#include "frontends/windows/automation/control/HiddenWindow.h"
#include "frontends/windows/automation/control/Library.h"

#include <Zandor/windows/WindowControl.h>

#include <functional>
#include <memory>
#include <optional>

namespace zandor::automation {

/// What the control stands on. A host may let go of its last reference while a procedure of the
/// control runs; the house, and the library's code with it, stays until that has returned and the
/// last message of its windows has been dealt with.
class House final : public TalvikDBxZandor::ZandorEvents {
public:
    using Sink =
        std::function<void(TalvikDBxZandor::Event, const TalvikDBxZandor::EventArguments&)>;

    /// A control with an empty query in a window that nobody sees; `sink` hears its events.
    static std::shared_ptr<House> build(Sink sink);

    TalvikDBxZandor::Zandor& control() { return *mZandor; }
    /// Until the control ends.
    const platform::windows::WindowControl& shown() const { return *mControl; }
    /// What it stands in while no form shows it.
    HWND hidden() const { return mHidden.handle(); }

    /// The control ends, and nobody hears of it.
    void end();

    void Raise(TalvikDBxZandor::Event event,
               const TalvikDBxZandor::EventArguments& arguments) override {
        if (const Sink sink = mSink) sink(event, arguments);
    }

private:
    explicit House(Sink sink) : mSink(std::move(sink)) {}

    const Keeping mKeeping; ///< goes last
    const HiddenWindow mHidden;
    Library mLibrary;
    Sink mSink;
    std::optional<platform::windows::WindowControl> mControl;
    TalvikDBxZandor::Zandor* mZandor = nullptr; ///< also while it ends
};

} // namespace zandor::automation

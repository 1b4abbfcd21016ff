#pragma once

#include "frontends/windows/automation/com/Module.h"
#include "frontends/windows/automation/control/Library.h"
#include "frontends/windows/automation/control/makeToolkit.h"

#include <Zandor/Zandor.h>

#include <functional>
#include <memory>
#include <optional>

namespace zandor::automation {

/// What the control stands on. A host may let go of its last reference while a procedure of the
/// control runs; the house, and the library's code with it, stays until that has returned.
class House final : public TalvikDBxZandor::ZandorEvents {
public:
    using Sink =
        std::function<void(TalvikDBxZandor::Event, const TalvikDBxZandor::EventArguments&)>;

    /// A control with an empty query; `sink` hears its events.
    static std::shared_ptr<House> build(Sink sink);

    TalvikDBxZandor::Zandor& control() { return *mControl; }

    /// The control ends, and nobody hears of it.
    void end();

    void Raise(TalvikDBxZandor::Event event,
               const TalvikDBxZandor::EventArguments& arguments) override {
        if (const Sink sink = mSink) sink(event, arguments);
    }

private:
    explicit House(Sink sink) : mToolkit(makeToolkit()), mSink(std::move(sink)) {}

    const Keeping mKeeping; ///< goes last
    const std::unique_ptr<platform::Toolkit> mToolkit;
    Library mLibrary;
    Sink mSink;
    std::optional<TalvikDBxZandor::Zandor> mControl;
};

} // namespace zandor::automation

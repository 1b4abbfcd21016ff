#pragma once

#include "comforts/Flags.h"
#include "platform/Toolkit.h"

#include <memory>

namespace TalvikDBxZandor {
class Zandor;
}

namespace comforts {

class Door;

/// What people expect of a query designer beyond the bare control, each comfort behind a flag.
///
/// A front end keeps one beside its toolkit, attached to the control for as long as there is one,
/// and forwards what its user does before the control hears of it. Each of these members answers
/// whether the comforts have dealt with it; what they have dealt with, the control is not told.
/// They act by the control's own procedures and events.
///
/// No member throws. A failure is reported in a message box, as the control's own are.
class Comforts {
public:
    static constexpr platform::StringView ModuleName = u"comforts.Comforts";

    /// The toolkit outlives the comforts.
    explicit Comforts(platform::Toolkit& toolkit);
    Comforts(const Comforts&) = delete;
    Comforts& operator=(const Comforts&) = delete;
    ~Comforts();

    void attach(TalvikDBxZandor::Zandor& control);
    void detach();

    const Flags& flags() const { return mFlags; }
    void setFlags(const Flags& flags) { mFlags = flags; }

    /// On an entry (1-based) of the table in a slot.
    bool entryDoubleClicked(std::int16_t table, std::int32_t entry);

private:
    /// Runs the body with the door to the control; false without a control.
    template <class Body>
    bool act(platform::StringView procedure, Body&& body);

    platform::Toolkit& mToolkit;
    Flags mFlags;
    std::unique_ptr<Door> mDoor;
};

} // namespace comforts

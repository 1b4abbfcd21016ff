#pragma once

#include "frontends/windows/automation/com/Held.h"
#include "frontends/windows/automation/com/Value.h"
#include "frontends/windows/automation/control/House.h"

#include <optional>

namespace zandor::automation {

/// What a container says of the surroundings that it gives to its controls: its font, its colours,
/// and whether its form is only being designed. At design time nobody is shown a box, a trace
/// included, and what is clicked is the container's.
class Ambience {
public:
    explicit Ambience(House& house) : mHouse(house) {}

    /// Takes over one of the properties of a site, or with DISPID_UNKNOWN all. What a site does not
    /// say stays as it is: a site that goes changes nothing.
    void read(IUnknown* site, DISPID which);
    // The same as given.
    void setFont(IUnknown* font) const;
    void setColours(std::optional<OLE_COLOR> ground, std::optional<OLE_COLOR> ink);
    void setDesigning(bool value);
    void setDead(bool value);

    bool isDesigning() const { return mDesigning; }

private:
    void enable() const;

    House& mHouse;
    std::optional<COLORREF> mGround, mInk;
    bool mDesigning = false;
    bool mDead = false; ///< the container takes no input, as in a debugger
};

} // namespace zandor::automation

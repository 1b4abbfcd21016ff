#pragma once

#include "frontends/windows/automation/com/Facet.h"
#include "frontends/windows/automation/container/Placement.h"
#include "frontends/windows/automation/control/ConnectionPoint.h"

namespace zandor::automation {

/// What a container asks of a control as such: its keys, its surroundings, silence.
class ControlSide final : public FacetOf<IOleControl> {
public:
    ControlSide(IUnknown& whole, Placement& placement, ConnectionPoint& events)
        : FacetOf(whole), mPlacement(placement), mEvents(events) {}

    STDMETHODIMP GetControlInfo(CONTROLINFO* info) override;
    STDMETHODIMP OnMnemonic(MSG* message) override;
    STDMETHODIMP OnAmbientPropertyChange(DISPID which) override;
    /// What happens meanwhile is told afterwards.
    STDMETHODIMP FreezeEvents(BOOL freeze) override;

private:
    Placement& mPlacement;
    ConnectionPoint& mEvents;
};

} // namespace zandor::automation

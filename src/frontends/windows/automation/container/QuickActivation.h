#pragma once

#include "frontends/windows/automation/com/Facet.h"
#include "frontends/windows/automation/container/Placement.h"
#include "frontends/windows/automation/container/View.h"
#include "frontends/windows/automation/control/ConnectionPoint.h"

namespace zandor::automation {

/// All that a container and a control tell each other at first, in one call.
class QuickActivation final : public FacetOf<IQuickActivate> {
public:
    QuickActivation(IUnknown& whole, Placement& placement, View& view, ConnectionPoint& events)
        : FacetOf(whole), mPlacement(placement), mView(view), mEvents(events) {}

    STDMETHODIMP QuickActivate(QACONTAINER* container, QACONTROL* control) override;
    STDMETHODIMP SetContentExtent(LPSIZEL extent) override;
    STDMETHODIMP GetContentExtent(LPSIZEL extent) override;

private:
    Placement& mPlacement;
    View& mView;
    ConnectionPoint& mEvents;
};

} // namespace zandor::automation

#include "frontends/windows/automation/control/ControlObject.h"

#include "frontends/windows/automation/com/ListEnumerator.h"
#include "frontends/windows/automation/com/ids.h"
#include "frontends/windows/automation/container/ControlSide.h"
#include "frontends/windows/automation/container/InPlaceObject.h"
#include "frontends/windows/automation/container/OleObject.h"
#include "frontends/windows/automation/container/QuickActivation.h"
#include "frontends/windows/automation/control/Safety.h"
#include "frontends/windows/automation/control/invoke.h"
#include "frontends/windows/automation/keeping/Persistence.h"
#include "frontends/windows/automation/pages/SpecifiedPages.h"

namespace zandor::automation {

namespace {

IConnectionPoint* lendPoint(const Held<IConnectionPoint>& point) { return point.copy(); }

} // namespace

ControlObject::ControlObject()
    : mHouse(House::build(
          [this](TalvikDBxZandor::Event event, const TalvikDBxZandor::EventArguments& arguments) {
              // The host may let go of its last reference as it hears it.
              const Held<_Zandor> meanwhile(this);
              mEvents.raise(event, arguments);
          })),
      mPlacement(static_cast<_Zandor&>(*this), *mHouse, [this] { pictureChanged(); }) {
    _Zandor& whole = *this;
    auto view = std::make_unique<View>(whole, *mHouse, mPlacement);
    mView = view.get();
    mFacets.push_back(std::make_unique<Safety>(whole));
    mFacets.push_back(std::make_unique<OleObject>(whole, mPlacement));
    mFacets.push_back(std::make_unique<InPlaceObject>(whole, mPlacement));
    mFacets.push_back(std::make_unique<ControlSide>(whole, mPlacement, mEvents));
    mFacets.push_back(std::make_unique<QuickActivation>(whole, mPlacement, *view, mEvents));
    mFacets.push_back(std::make_unique<Persistence>(whole, *mHouse));
    mFacets.push_back(std::make_unique<SpecifiedPages>(whole));
    mFacets.push_back(std::move(view));
}

ControlObject::~ControlObject() {
    mPlacement.end();
    mHouse->end();
}

void ControlObject::pictureChanged() {
    // On the screen everybody sees it.
    if (mView && !mPlacement.isActive()) mView->changed();
}

void* ControlObject::findMore(REFIID iid) {
    if (iid == IID_IProvideClassInfo) return static_cast<IProvideClassInfo2*>(this);
    for (const auto& facet : mFacets)
        if (void* const found = facet->find(iid)) return found;
    return nullptr;
}

STDMETHODIMP ControlObject::Invoke(DISPID member, REFIID iid, LCID, WORD flags,
                                   DISPPARAMS* arguments, VARIANT* result, EXCEPINFO* failure,
                                   UINT* wrong) {
    if (iid != IID_NULL) return DISP_E_UNKNOWNINTERFACE;
    if (!arguments) return E_POINTER;
    const Held<_Zandor> meanwhile(this);
    const HRESULT answered =
        invoke(mHouse->control(), member, flags, *arguments, result, failure, wrong);
    if (SUCCEEDED(answered) && !(flags & DISPATCH_PROPERTYGET)) pictureChanged();
    return answered;
}

STDMETHODIMP ControlObject::EnumConnectionPoints(IEnumConnectionPoints** points) {
    return answer([&] {
        using Point = Held<IConnectionPoint>;
        placeOf(points) =
            ListEnumerator<IEnumConnectionPoints, IConnectionPoint*, Point, &lendPoint>::begin(
                {Point(&mEvents)});
    });
}

STDMETHODIMP ControlObject::FindConnectionPoint(REFIID iid, IConnectionPoint** point) {
    if (!point) return E_POINTER;
    *point = nullptr;
    // A script knows the events by their dispatch ids alone.
    if (iid != ids::controlEvents && iid != IID_IDispatch) return CONNECT_E_NOCONNECTION;
    *point = Held<IConnectionPoint>(&mEvents).detach();
    return S_OK;
}

STDMETHODIMP ControlObject::GetClassInfo(ITypeInfo** info) {
    return answer([&] { placeOf(info) = module::typeInfo(ids::control).detach(); });
}

STDMETHODIMP ControlObject::GetGUID(DWORD kind, GUID* id) {
    if (!id) return E_POINTER;
    if (kind != GUIDKIND_DEFAULT_SOURCE_DISP_IID) {
        *id = GUID_NULL;
        return E_INVALIDARG;
    }
    *id = ids::controlEvents;
    return S_OK;
}

} // namespace zandor::automation

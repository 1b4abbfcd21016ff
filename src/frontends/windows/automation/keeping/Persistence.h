#pragma once

#include "frontends/windows/automation/com/Facet.h"
#include "frontends/windows/automation/control/House.h"
#include "frontends/windows/automation/keeping/State.h"

namespace zandor::automation {

/// How a container keeps the control and has it back: as bytes in a stream, or by the names of its
/// members in a bag. What cannot be the control's is refused, and the control stays as it was.
class Persistence final : public FacetOf<IPersistStreamInit, IPersistPropertyBag> {
public:
    Persistence(IUnknown& whole, House& house);

    void* find(REFIID iid) override;

    STDMETHODIMP GetClassID(CLSID* id) override;
    /// Of both. E_UNEXPECTED once it has been loaded.
    STDMETHODIMP InitNew() override;

    STDMETHODIMP IsDirty() override;
    STDMETHODIMP Load(IStream* stream) override;
    STDMETHODIMP Save(IStream* stream, BOOL clear) override;
    STDMETHODIMP GetSizeMax(ULARGE_INTEGER* size) override;

    /// What the bag has no value for stays as a new control has it. E_UNEXPECTED once the control
    /// has been loaded, for a bag is read into a new one.
    STDMETHODIMP Load(IPropertyBag* bag, IErrorLog* log) override;
    STDMETHODIMP Save(IPropertyBag* bag, BOOL clear, BOOL all) override;

private:
    State present() const { return stateOf(mHouse.control()); }
    void take(const State& state);

    House& mHouse;
    const State mAtFirst; ///< of a new control
    State mSaved;         ///< as it was saved or loaded last
    bool mIsLoaded = false;
};

} // namespace zandor::automation

#pragma once

#include "frontends/windows/automation/com/Dual.h"
#include "frontends/windows/automation/com/Facet.h"
#include "frontends/windows/automation/container/Placement.h"
#include "frontends/windows/automation/container/View.h"
#include "frontends/windows/automation/control/ConnectionPoint.h"
#include "frontends/windows/automation/control/House.h"

#include <control.h>

namespace zandor::automation {

/// The control as an object of automation: its public interface early- and late-bound, its events,
/// and what a host asks about it. No member of the public interface fails for what the control
/// reports to its user.
class ControlObject final : public Dual<_Zandor, IConnectionPointContainer, IProvideClassInfo2> {
public:
    ControlObject();
    ~ControlObject() override;

    // The public interface late-bound
    STDMETHODIMP Invoke(DISPID member, REFIID iid, LCID locale, WORD flags, DISPPARAMS* arguments,
                        VARIANT* result, EXCEPINFO* failure, UINT* wrong) override;

    // And early-bound: ControlMembers.cpp
#define ZANDOR_MEMBER(number, type, name)                                                          \
    STDMETHODIMP get_##name(type* value) override;                                                 \
    STDMETHODIMP put_##name(type value) override;
#define ZANDOR_MEMBER_BY_REFERENCE(number, type, name)                                             \
    STDMETHODIMP get_##name(type* value) override;                                                 \
    STDMETHODIMP put_##name(type* value) override;
#define ZANDOR_OBJECT(number, type, name)                                                          \
    STDMETHODIMP get_##name(type** value) override;                                                \
    STDMETHODIMP putref_##name(type* value) override;
#define ZANDOR_NOTHING(number, type, name) STDMETHODIMP get_##name(type** value) override;
#include "frontends/windows/automation/members.def"
#undef ZANDOR_MEMBER
#undef ZANDOR_MEMBER_BY_REFERENCE
#undef ZANDOR_OBJECT
#undef ZANDOR_NOTHING
    STDMETHODIMP Terminate() override;
    STDMETHODIMP SelectColumnNames(BSTR* TabName, BSTR* ColName) override;
    STDMETHODIMP SetCurrentTable(BSTR TabName) override;

    // Its events
    STDMETHODIMP EnumConnectionPoints(IEnumConnectionPoints** points) override;
    STDMETHODIMP FindConnectionPoint(REFIID iid, IConnectionPoint** point) override;

    // What it is
    STDMETHODIMP GetClassInfo(ITypeInfo** info) override;
    STDMETHODIMP GetGUID(DWORD kind, GUID* id) override;

protected:
    void* findMore(REFIID iid) override;

private:
    void pictureChanged();
    template <class Value>
    HRESULT read(std::uint32_t member, Value* value);
    template <class Value>
    HRESULT write(std::uint32_t member, Value value);
    template <class Object>
    HRESULT readObject(std::uint32_t member, Object** value);

    ConnectionPoint mEvents{*this};
    const std::shared_ptr<House> mHouse;
    Placement mPlacement;
    View* mView = nullptr;                       ///< one of the following
    std::vector<std::unique_ptr<Facet>> mFacets; ///< what else it is
};

} // namespace zandor::automation

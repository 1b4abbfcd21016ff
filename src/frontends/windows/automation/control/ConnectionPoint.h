#pragma once

#include "frontends/windows/automation/com/Held.h"

#include <Zandor/control/Events.h>

#include <deque>
#include <utility>
#include <vector>

namespace zandor::automation {

/// Where hosts say that they want to hear the ten events. A part of the control's object, and
/// counted with it.
class ConnectionPoint final : public IConnectionPoint {
public:
    explicit ConnectionPoint(IConnectionPointContainer& whole) : mWhole(whole) {}

    /// Tells all that listen, in the order in which they came. One that goes meanwhile is not told,
    /// and what one answers is nobody's business.
    void raise(TalvikDBxZandor::Event event, const TalvikDBxZandor::EventArguments& arguments);
    /// From now on nobody is told anything, as often as this is said, until it is taken back as
    /// often; then all are told what has happened meanwhile, in that order.
    void freeze() { ++mFrozen; }
    void thaw();
    /// Lets go of all that listen.
    void forget() { mSinks.clear(); }

    STDMETHODIMP QueryInterface(REFIID iid, void** object) override;
    STDMETHODIMP_(ULONG) AddRef() override { return mWhole.AddRef(); }
    STDMETHODIMP_(ULONG) Release() override { return mWhole.Release(); }

    STDMETHODIMP GetConnectionInterface(IID* iid) override;
    STDMETHODIMP GetConnectionPointContainer(IConnectionPointContainer** container) override;
    STDMETHODIMP Advise(IUnknown* sink, DWORD* cookie) override;
    STDMETHODIMP Unadvise(DWORD cookie) override;
    STDMETHODIMP EnumConnections(IEnumConnections** connections) override;

private:
    struct Sink {
        DWORD cookie;
        Held<IDispatch> object;
    };

    static CONNECTDATA lend(const Sink& sink);
    bool isThere(DWORD cookie) const;

    IConnectionPointContainer& mWhole;
    std::vector<Sink> mSinks;
    std::deque<std::pair<TalvikDBxZandor::Event, TalvikDBxZandor::EventArguments>> mWaiting;
    int mFrozen = 0;
    DWORD mLastCookie = 0;
};

} // namespace zandor::automation

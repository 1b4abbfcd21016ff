#include "frontends/windows/automation/control/ConnectionPoint.h"

#include "frontends/windows/automation/com/Failure.h"
#include "frontends/windows/automation/com/ListEnumerator.h"
#include "frontends/windows/automation/com/Value.h"
#include "frontends/windows/automation/com/ids.h"
#include "frontends/windows/automation/model/Exchange.h"

#include <Zandor/Interface.h>

#include <algorithm>

namespace zandor::automation {

namespace {

using TalvikDBxZandor::Event;
using TalvikDBxZandor::EventArguments;
using TalvikDBxZandor::automation::Carries;

Carries carriedBy(Event event) {
    for (const auto& member : TalvikDBxZandor::automation::events())
        if (member.number == event) return member.arguments;
    return Carries::nothing;
}

/// What an event carries, backwards, as the system has arguments.
std::vector<Value> argumentsOf(Event event, const EventArguments& given) {
    std::vector<Value> arguments;
    switch (carriedBy(event)) {
    case Carries::nothing: break;
    case Carries::definition: arguments.emplace_back(toHost(given.Definition)); break;
    case Carries::join: arguments.emplace_back(toHost(given.Join)); break;
    case Carries::textAndNumber:
        arguments.emplace_back(given.Number);
        arguments.emplace_back(platform::StringView(given.Text));
        break;
    }
    return arguments;
}

} // namespace

void ConnectionPoint::thaw() {
    if (mFrozen == 0 || --mFrozen > 0) return;
    while (mFrozen == 0 && !mWaiting.empty()) {
        const auto next = std::move(mWaiting.front());
        mWaiting.pop_front();
        raise(next.first, next.second);
    }
}

void ConnectionPoint::raise(Event event, const EventArguments& given) {
    if (mFrozen > 0) {
        mWaiting.emplace_back(event, given);
        return;
    }
    const std::vector<Sink> sinks = mSinks;
    std::vector<Value> arguments = argumentsOf(event, given);
    for (const Sink& sink : sinks) {
        if (!isThere(sink.cookie)) continue;
        DISPPARAMS parameters{arguments.data(), nullptr, static_cast<UINT>(arguments.size()), 0};
        Value ignored;
        EXCEPINFO failure{};
        sink.object->Invoke(static_cast<DISPID>(event), IID_NULL, LOCALE_USER_DEFAULT,
                            DISPATCH_METHOD, &parameters, &ignored, &failure, nullptr);
        SysFreeString(failure.bstrSource);
        SysFreeString(failure.bstrDescription);
        SysFreeString(failure.bstrHelpFile);
    }
}

bool ConnectionPoint::isThere(DWORD cookie) const {
    return std::any_of(mSinks.begin(), mSinks.end(),
                       [&](const Sink& sink) { return sink.cookie == cookie; });
}

STDMETHODIMP ConnectionPoint::QueryInterface(REFIID iid, void** object) {
    if (!object) return E_POINTER;
    *object = iid == IID_IUnknown || iid == IID_IConnectionPoint ? this : nullptr;
    if (!*object) return E_NOINTERFACE;
    AddRef();
    return S_OK;
}

STDMETHODIMP ConnectionPoint::GetConnectionInterface(IID* iid) {
    if (!iid) return E_POINTER;
    *iid = ids::controlEvents;
    return S_OK;
}

STDMETHODIMP
ConnectionPoint::GetConnectionPointContainer(IConnectionPointContainer** container) {
    if (!container) return E_POINTER;
    *container = &mWhole;
    mWhole.AddRef();
    return S_OK;
}

STDMETHODIMP ConnectionPoint::Advise(IUnknown* sink, DWORD* cookie) {
    if (!sink || !cookie) return E_POINTER;
    *cookie = 0;
    Held<IDispatch> object;
    if (FAILED(sink->QueryInterface(ids::controlEvents, object.slotOfAny())))
        object = Held<IDispatch>::of(sink);
    if (!object) return CONNECT_E_CANNOTCONNECT;
    return answer([&] {
        mSinks.push_back({mLastCookie + 1, object});
        *cookie = ++mLastCookie;
    });
}

STDMETHODIMP ConnectionPoint::Unadvise(DWORD cookie) {
    const auto found = std::find_if(mSinks.begin(), mSinks.end(),
                                    [&](const Sink& sink) { return sink.cookie == cookie; });
    if (found == mSinks.end()) return CONNECT_E_NOCONNECTION;
    // Held meanwhile: it may do anything as it goes.
    const Sink going = *found;
    mSinks.erase(found);
    return S_OK;
}

CONNECTDATA ConnectionPoint::lend(const Sink& sink) { return {sink.object.copy(), sink.cookie}; }

STDMETHODIMP ConnectionPoint::EnumConnections(IEnumConnections** connections) {
    return answer([&] {
        placeOf(connections) =
            ListEnumerator<IEnumConnections, CONNECTDATA, Sink, &lend>::begin(mSinks);
    });
}

} // namespace zandor::automation

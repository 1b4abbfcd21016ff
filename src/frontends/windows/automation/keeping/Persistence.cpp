#include "frontends/windows/automation/keeping/Persistence.h"

#include "frontends/windows/automation/com/Failure.h"
#include "frontends/windows/automation/com/ids.h"
#include "frontends/windows/automation/control/Conversion.h"
#include "frontends/windows/automation/keeping/StateStream.h"

namespace zandor::automation {

namespace {

using TalvikDBxZandor::automation::Member;
using TalvikDBxZandor::automation::Type;

std::wstring nameOf(const Member& member) {
    return {reinterpret_cast<const wchar_t*>(member.name.data()), member.name.size()};
}

VARTYPE kindOf(Type type) {
    return type == Type::String ? VT_BSTR : type == Type::Boolean ? VT_BOOL : VT_I2;
}

/// The value that a bag has of a member; `otherwise` where it has none.
platform::Variant valueIn(IPropertyBag& bag, IErrorLog* log, const Member& member,
                          const platform::Variant& otherwise) {
    const std::wstring name = nameOf(member);
    Value value;
    value.vt = kindOf(member.type); // as which it is wanted
    value.bstrVal = nullptr;
    const HRESULT read = bag.Read(name.c_str(), &value, log);
    if (read == E_INVALIDARG) return otherwise;
    require(read);
    try {
        return fromHost(member.type, value);
    } catch (const platform::RuntimeError& error) {
        if (log) {
            EXCEPINFO said{};
            platform::String words = error.Description;
            const Text description(words);
            said.bstrDescription = description.get();
            said.scode = codeOf(error.Number);
            log->AddError(name.c_str(), &said);
        }
        throw;
    }
}

/// What a member is without a value of its own: as at first, or as the one whose other name it is.
const platform::Variant& otherwise(const State& read, const State& atFirst) {
    const auto& members = keptMembers();
    const std::size_t place = read.size();
    platform::StringView same;
    if (members[place]->name == u"UseJoinCompareOperatorLE")
        same = u"UseJoinCompareOperatorLessEquals";
    if (members[place]->name == u"UseJoinCompareOperatorGE")
        same = u"UseJoinCompareOperatorGreaterEquals";
    for (std::size_t n = 0; n < place; ++n)
        if (members[n]->name == same) return read[n];
    return atFirst[place];
}

} // namespace

Persistence::Persistence(IUnknown& whole, House& house)
    : FacetOf(whole), mHouse(house), mAtFirst(stateOf(house.control())), mSaved(mAtFirst) {}

void* Persistence::find(REFIID iid) {
    if (iid == IID_IPersist) return static_cast<IPersistStreamInit*>(this);
    return FacetOf::find(iid);
}

void Persistence::take(const State& state) {
    restore(mHouse.control(), state);
    mSaved = present();
    mIsLoaded = true;
}

STDMETHODIMP Persistence::GetClassID(CLSID* id) {
    if (!id) return E_POINTER;
    *id = ids::control;
    return S_OK;
}

STDMETHODIMP Persistence::InitNew() { return mIsLoaded ? E_UNEXPECTED : S_OK; }

STDMETHODIMP Persistence::IsDirty() {
    bool changed = true;
    const HRESULT compared = answer([&] { changed = present() != mSaved; });
    return FAILED(compared) || changed ? S_OK : S_FALSE;
}

STDMETHODIMP Persistence::Load(IStream* stream) {
    if (!stream) return E_POINTER;
    const Held<IUnknown> meanwhile(&whole());
    return answer([&] { take(readState(*stream)); });
}

STDMETHODIMP Persistence::Save(IStream* stream, BOOL clear) {
    if (!stream) return E_POINTER;
    const Held<IUnknown> meanwhile(&whole());
    return answer([&] {
        State state = present();
        const auto bytes = bytesOf(state);
        ULONG written = 0;
        require(stream->Write(bytes.data(), static_cast<ULONG>(bytes.size()), &written));
        if (written != bytes.size()) throw errorOf(STG_E_MEDIUMFULL);
        if (clear) mSaved = std::move(state);
    });
}

STDMETHODIMP Persistence::GetSizeMax(ULARGE_INTEGER* size) {
    if (!size) return E_POINTER;
    return answer([&] { size->QuadPart = bytesOf(present()).size(); });
}

STDMETHODIMP Persistence::Load(IPropertyBag* bag, IErrorLog* log) {
    if (!bag) return E_POINTER;
    if (mIsLoaded) return E_UNEXPECTED;
    const Held<IUnknown> meanwhile(&whole());
    return answer([&] {
        State state;
        for (const Member* const member : keptMembers())
            state.push_back(valueIn(*bag, log, *member, otherwise(state, mAtFirst)));
        if (!isPossible(state)) throw platform::errors::invalidPropertyValue();
        take(state);
    });
}

STDMETHODIMP Persistence::Save(IPropertyBag* bag, BOOL clear, BOOL all) {
    if (!bag) return E_POINTER;
    const Held<IUnknown> meanwhile(&whole());
    return answer([&] {
        State state = present();
        const auto& members = keptMembers();
        for (std::size_t n = 0; n < members.size(); ++n) {
            if (!all && state[n] == mAtFirst[n]) continue;
            Value value = toHost(state[n]);
            require(bag->Write(nameOf(*members[n]).c_str(), &value));
        }
        if (clear) mSaved = std::move(state);
    });
}

} // namespace zandor::automation

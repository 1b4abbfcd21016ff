#include "ScriptHost.h"

#include "frontends/windows/automation/com/Failure.h"

#include <Zandor/windows/Counted.h>

#include <algorithm>
#include <map>
#include <utility>

using namespace zandor;
using namespace zandor::automation;

namespace {

/// The interface that a class raises its events by, as the class itself declares it.
Held<ITypeInfo> eventsOf(IUnknown* object) {
    const auto described = Held<IProvideClassInfo>::of(object);
    if (!described) throw Scripted::Failure{E_NOINTERFACE, u"It says of no events"};
    Held<ITypeInfo> declared;
    require(described->GetClassInfo(declared.slot()));
    TYPEATTR* attributes = nullptr;
    require(declared->GetTypeAttr(&attributes));
    const UINT count = attributes->cImplTypes;
    declared->ReleaseTypeAttr(attributes);
    for (UINT n = 0; n < count; ++n) {
        constexpr INT wanted = IMPLTYPEFLAG_FDEFAULT | IMPLTYPEFLAG_FSOURCE;
        INT flags = 0;
        require(declared->GetImplTypeFlags(n, &flags));
        if ((flags & wanted) != wanted) continue;
        HREFTYPE place = 0;
        require(declared->GetRefTypeOfImplType(n, &place));
        Held<ITypeInfo> events;
        require(declared->GetRefTypeInfo(place, events.slot()));
        return events;
    }
    throw Scripted::Failure{E_NOINTERFACE, u"It says of no events"};
}

GUID idOf(ITypeInfo& info) {
    TYPEATTR* attributes = nullptr;
    require(info.GetTypeAttr(&attributes));
    const GUID id = attributes->guid;
    info.ReleaseTypeAttr(attributes);
    return id;
}

std::map<DISPID, std::wstring> namesIn(ITypeInfo& events) {
    std::map<DISPID, std::wstring> names;
    FUNCDESC* function = nullptr;
    for (UINT n = 0; SUCCEEDED(events.GetFuncDesc(n, &function)); ++n) {
        Text name;
        events.GetDocumentation(function->memid, name.slot(), nullptr, nullptr, nullptr);
        if (name.get()) names[function->memid] = name.get();
        events.ReleaseFuncDesc(function);
    }
    return names;
}

std::wstring wideOf(const VARIANT& value) {
    const platform::String text = stringOf(value);
    return {wide(text), text.size()};
}

} // namespace

/// What an engine asks of who runs it.
class ScriptHost::Site final : public platform::windows::Counted<IActiveScriptSite> {
public:
    std::map<std::wstring, Held<IDispatch>> lent;
    std::string failure;

    STDMETHODIMP GetLCID(LCID* locale) override {
        *locale = LOCALE_USER_DEFAULT;
        return S_OK;
    }
    STDMETHODIMP GetItemInfo(LPCOLESTR name, DWORD wanted, IUnknown** object,
                             ITypeInfo** info) override {
        const auto found = lent.find(name);
        if (info) *info = nullptr;
        if (found == lent.end()) return TYPE_E_ELEMENTNOTFOUND;
        if ((wanted & SCRIPTINFO_IUNKNOWN) && object) *object = found->second.copy();
        return S_OK;
    }
    STDMETHODIMP GetDocVersionString(BSTR*) override { return E_NOTIMPL; }
    STDMETHODIMP OnScriptTerminate(const VARIANT*, const EXCEPINFO*) override { return S_OK; }
    STDMETHODIMP OnStateChange(SCRIPTSTATE) override { return S_OK; }
    STDMETHODIMP OnScriptError(IActiveScriptError* error) override {
        EXCEPINFO said{};
        DWORD context = 0;
        ULONG line = 0;
        LONG column = 0;
        error->GetExceptionInfo(&said);
        error->GetSourcePosition(&context, &line, &column);
        failure = std::to_string(line + 1) + ": " + platform::toUtf8(textOf(said.bstrDescription)) +
                  " (" + std::to_string(said.scode) + ")";
        SysFreeString(said.bstrSource);
        SysFreeString(said.bstrDescription);
        SysFreeString(said.bstrHelpFile);
        return S_OK;
    }
    STDMETHODIMP OnEnterScript() override { return S_OK; }
    STDMETHODIMP OnLeaveScript() override { return S_OK; }
};

struct ScriptHost::Link {
    Held<IDispatch> object;
    Held<IConnectionPoint> point;
    DWORD cookie = 0;
};

ScriptHost::ScriptHost(const wchar_t* language) : mSelf(Scripted::make()), mSite(new Site) {
    mSelf->have(L"Echo", [this](WORD, const Scripted::Arguments& given) { return echo(given); });
    mSelf->have(L"CreateObject", [this](WORD, const Scripted::Arguments& given) {
        CLSID id{};
        require(CLSIDFromProgID(wideOf(*given.at(0)).c_str(), &id));
        Held<IDispatch> made;
        require(
            CoCreateInstance(id, nullptr, CLSCTX_INPROC_SERVER, IID_IDispatch, made.slotOfAny()));
        if (given.size() > 1) connect(made.get(), wideOf(*given[1]));
        return Value(made);
    });
    mSelf->have(L"ConnectObject", [this](WORD, const Scripted::Arguments& given) {
        connect(objectOf(*given.at(0)).get(), wideOf(*given.at(1)));
        return Value();
    });
    mSelf->have(L"DisconnectObject", [this](WORD, const Scripted::Arguments& given) {
        disconnect(objectOf(*given.at(0)).get());
        return Value();
    });

    CLSID id{};
    require(CLSIDFromProgID(language, &id));
    require(CoCreateInstance(id, nullptr, CLSCTX_INPROC_SERVER, IID_IActiveScript,
                             mEngine.slotOfAny()));
    require(mEngine->SetScriptSite(mSite.get()));
    require(Held<IActiveScriptParse>::of(mEngine.get())->InitNew());
    lend(L"WScript", mSelf.get());
}

ScriptHost::~ScriptHost() {
    while (!mLinks.empty()) disconnect(Held<IDispatch>(mLinks.back().object).get());
    mEngine->Close();
}

void ScriptHost::lend(const wchar_t* name, IDispatch* object) {
    mSite->lent[name] = object;
    require(mEngine->AddNamedItem(name, SCRIPTITEM_ISVISIBLE));
}

bool ScriptHost::run(const std::wstring& script) {
    mSite->failure.clear();
    EXCEPINFO failure{};
    const HRESULT read = Held<IActiveScriptParse>::of(mEngine.get())
                             ->ParseScriptText(script.c_str(), nullptr, nullptr, nullptr, 0, 0,
                                               SCRIPTTEXT_ISVISIBLE, nullptr, &failure);
    if (FAILED(read)) return false;
    // What was read before it was connected runs now; from then on it runs as it is read.
    return SUCCEEDED(mEngine->SetScriptState(SCRIPTSTATE_CONNECTED)) && mSite->failure.empty();
}

const std::string& ScriptHost::failure() const { return mSite->failure; }

void ScriptHost::connect(IDispatch* object, const std::wstring& prefix) {
    const Held<ITypeInfo> events = eventsOf(object);
    const auto sink = Scripted::make();
    for (const auto& [number, name] : namesIn(*events.get()))
        sink->have(
            name.c_str(),
            [this, procedure = prefix + name](WORD, const Scripted::Arguments& arguments) {
                return callIfThere(procedure, arguments);
            },
            number);
    Link link;
    link.object = object;
    const auto points = Held<IConnectionPointContainer>::of(object);
    if (!points) throw Scripted::Failure{E_NOINTERFACE, u"It raises no events"};
    require(points->FindConnectionPoint(idOf(*events.get()), link.point.slot()));
    require(link.point->Advise(sink.get(), &link.cookie));
    mLinks.push_back(link);
}

void ScriptHost::disconnect(IDispatch* object) {
    const auto found = std::find_if(mLinks.begin(), mLinks.end(),
                                    [&](const Link& link) { return link.object.get() == object; });
    if (found == mLinks.end()) return;
    const Link going = *found;
    mLinks.erase(found);
    going.point->Unadvise(going.cookie);
}

Value ScriptHost::callIfThere(const std::wstring& procedure,
                              const Scripted::Arguments& arguments) const {
    Held<IDispatch> script;
    require(mEngine->GetScriptDispatch(nullptr, script.slot()));
    auto* name = const_cast<wchar_t*>(procedure.c_str());
    DISPID number = DISPID_UNKNOWN;
    if (FAILED(script->GetIDsOfNames(IID_NULL, &name, 1, LOCALE_USER_DEFAULT, &number)))
        return Value();
    std::vector<VARIANT> backwards;
    for (const VARIANT* argument : arguments) backwards.insert(backwards.begin(), *argument);
    DISPPARAMS given{backwards.data(), nullptr, static_cast<UINT>(backwards.size()), 0};
    Value ignored;
    require(script->Invoke(number, IID_NULL, LOCALE_USER_DEFAULT, DISPATCH_METHOD, &given, &ignored,
                           nullptr, nullptr));
    return Value();
}

Value ScriptHost::echo(const Scripted::Arguments& arguments) {
    std::string line;
    for (const VARIANT* argument : arguments)
        line += (line.empty() ? "" : " ") + platform::toUtf8(stringOf(*argument));
    mSaid.push_back(line);
    return Value();
}

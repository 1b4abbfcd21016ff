#include "Dll.h"
#include "Functions.h"

#include "frontends/windows/automation/com/Text.h"

#include <gtest/gtest.h>

#include <map>

// What is registered is what the table of the control says.

using namespace zandor;
using namespace zandor::automation;

namespace {

Held<ITypeLib> library(int number) {
    Held<ITypeLib> found;
    EXPECT_HRESULT_SUCCEEDED(LoadRegTypeLib(number == 1 ? ids::controlLibrary : ids::modelLibrary,
                                            1, 0, 0, found.slot()));
    return found;
}

std::string nameOf(ITypeInfo& info) {
    Text name;
    info.GetDocumentation(MEMBERID_NIL, name.slot(), nullptr, nullptr, nullptr);
    return platform::toUtf8(name.string());
}

std::string typeOf(ITypeInfo& info, const TYPEDESC& type) {
    switch (type.vt) {
    case VT_PTR: return typeOf(info, *type.lptdesc) + "*";
    case VT_BSTR: return "BSTR";
    case VT_BOOL: return "VARIANT_BOOL";
    case VT_I2: return "short";
    case VT_I4: return "long";
    case VT_DISPATCH: return "IDispatch*";
    case VT_VOID: return "void";
    case VT_HRESULT: return "HRESULT";
    case VT_USERDEFINED: {
        Held<ITypeInfo> named;
        EXPECT_HRESULT_SUCCEEDED(info.GetRefTypeInfo(type.hreftype, named.slot()));
        return named ? nameOf(*named.get()) : "?";
    }
    default: return "type " + std::to_string(type.vt);
    }
}

std::string wordOf(const FUNCDESC& function) {
    switch (function.invkind) {
    case INVOKE_PROPERTYGET: return "get ";
    case INVOKE_PROPERTYPUT: return "put ";
    case INVOKE_PROPERTYPUTREF: return "set ";
    default: return "";
    }
}

std::string parametersOf(ITypeInfo& info, const FUNCDESC& function, BSTR* names) {
    std::string text;
    for (int n = 0; n < function.cParams; ++n) {
        const ELEMDESC& parameter = function.lprgelemdescParam[n];
        const USHORT flags = parameter.paramdesc.wParamFlags;
        if (!text.empty()) text += ", ";
        if (flags & PARAMFLAG_FIN) text += "in ";
        if (flags & PARAMFLAG_FOUT) text += "out ";
        text += typeOf(info, parameter.tdesc);
        if (function.invkind == INVOKE_FUNC) text += " " + platform::toUtf8(textOf(names[n + 1]));
    }
    return text;
}

/// Those of the interface itself, and not of IDispatch.
Functions functionsOf(ITypeInfo& info) {
    Functions functions;
    TYPEATTR* attributes = nullptr;
    EXPECT_HRESULT_SUCCEEDED(info.GetTypeAttr(&attributes));
    for (UINT n = 0; n < attributes->cFuncs; ++n) {
        FUNCDESC* function = nullptr;
        EXPECT_HRESULT_SUCCEEDED(info.GetFuncDesc(n, &function));
        BSTR names[8] = {};
        UINT named = 0;
        info.GetNames(function->memid, names, 8, &named);
        if (!(function->wFuncFlags & FUNCFLAG_FRESTRICTED))
            functions.emplace(function->memid, wordOf(*function) +
                                                   platform::toUtf8(textOf(names[0])) + "(" +
                                                   parametersOf(info, *function, names) + ")");
        for (const BSTR name : names) SysFreeString(name);
        info.ReleaseFuncDesc(function);
    }
    info.ReleaseTypeAttr(attributes);
    return functions;
}

Functions declared(REFGUID id) {
    Held<ITypeInfo> dispatch;
    EXPECT_HRESULT_SUCCEEDED(library(1)->GetTypeInfoOfGuid(id, dispatch.slot()));
    // Of a dual interface the side with the methods of the table.
    HREFTYPE reference = 0;
    Held<ITypeInfo> dual;
    if (SUCCEEDED(dispatch->GetRefTypeOfImplType(UINT(-1), &reference)) &&
        SUCCEEDED(dispatch->GetRefTypeInfo(reference, dual.slot())))
        return functionsOf(*dual.get());
    return functionsOf(*dispatch.get());
}

/// Registered, for one library finds the other by that.
class TheTypeLibrary : public testing::Test {
protected:
    static void SetUpTestSuite() { EXPECT_EQ(registrar("DllRegisterServer"), S_OK); }
    static void TearDownTestSuite() { EXPECT_EQ(registrar("DllUnregisterServer"), S_OK); }

private:
    static HRESULT registrar(const char* name) {
        return Dll::get().entry<HRESULT(STDAPICALLTYPE*)()>(name)();
    }
};

} // namespace

TEST_F(TheTypeLibrary, DeclaresTheInterfaceAsTheControlsTableHasIt) {
    const Functions expected = functionsOfTheTable();
    EXPECT_EQ(expected.size(), 124U);
    EXPECT_EQ(declared(__uuidof(_Zandor)), expected);
}

TEST_F(TheTypeLibrary, SaysWhereAMethodStandsInTheTable) {
    // Behind the seven of IDispatch, one after the other.
    for (const GUID& id : {__uuidof(_Zandor), __uuidof(_ZDQuery), __uuidof(_ZDCollection)}) {
        Held<ITypeInfo> info;
        const int number = id == __uuidof(_Zandor) ? 1 : 2;
        ASSERT_HRESULT_SUCCEEDED(library(number)->GetTypeInfoOfGuid(id, info.slot()));
        HREFTYPE reference = 0;
        Held<ITypeInfo> dual;
        ASSERT_HRESULT_SUCCEEDED(info->GetRefTypeOfImplType(UINT(-1), &reference));
        ASSERT_HRESULT_SUCCEEDED(info->GetRefTypeInfo(reference, dual.slot()));
        FUNCDESC* function = nullptr;
        for (UINT n = 0; SUCCEEDED(dual->GetFuncDesc(n, &function)); ++n) {
            EXPECT_EQ(function->oVft, static_cast<SHORT>((7 + n) * sizeof(void*)));
            dual->ReleaseFuncDesc(function);
        }
    }
}

TEST_F(TheTypeLibrary, DeclaresTheEventsUnderTheirNumbers) {
    const Functions expected = eventsOfTheTable();
    EXPECT_EQ(expected.size(), 10U);
    EXPECT_EQ(declared(ids::controlEvents), expected);
}

TEST_F(TheTypeLibrary, NamesTheInterfacesOfTheControlsClass) {
    Held<ITypeInfo> info;
    ASSERT_HRESULT_SUCCEEDED(library(1)->GetTypeInfoOfGuid(ids::control, info.slot()));
    EXPECT_EQ(nameOf(*info.get()), "Zandor");
    TYPEATTR* attributes = nullptr;
    ASSERT_HRESULT_SUCCEEDED(info->GetTypeAttr(&attributes));
    EXPECT_EQ(attributes->typekind, TKIND_COCLASS);
    EXPECT_TRUE(attributes->wTypeFlags & TYPEFLAG_FCONTROL);
    EXPECT_TRUE(attributes->wTypeFlags & TYPEFLAG_FCANCREATE);
    std::map<std::string, int> interfaces;
    for (UINT n = 0; n < attributes->cImplTypes; ++n) {
        HREFTYPE reference = 0;
        INT flags = 0;
        Held<ITypeInfo> type;
        info->GetImplTypeFlags(n, &flags);
        ASSERT_HRESULT_SUCCEEDED(info->GetRefTypeOfImplType(n, &reference));
        ASSERT_HRESULT_SUCCEEDED(info->GetRefTypeInfo(reference, type.slot()));
        interfaces[nameOf(*type.get())] = flags;
    }
    info->ReleaseTypeAttr(attributes);
    EXPECT_EQ(interfaces, (std::map<std::string, int>{
                              {"_Zandor", IMPLTYPEFLAG_FDEFAULT},
                              {"__Zandor", IMPLTYPEFLAG_FDEFAULT | IMPLTYPEFLAG_FSOURCE}}));
}

TEST_F(TheTypeLibrary, BearsTheNameOfItsComponent) {
    const char* const names[] = {"TalvikDBxZandor", "TalvikZandorLib"};
    for (const int number : {1, 2}) {
        Text name;
        library(number)->GetDocumentation(-1, name.slot(), nullptr, nullptr, nullptr);
        EXPECT_EQ(platform::toUtf8(name.string()), names[number - 1]);
        TLIBATTR* attributes = nullptr;
        ASSERT_HRESULT_SUCCEEDED(library(number)->GetLibAttr(&attributes));
        EXPECT_EQ(attributes->guid, number == 1 ? ids::controlLibrary : ids::modelLibrary);
        library(number)->ReleaseTLibAttr(attributes);
    }
}

#include "Dll.h"
#include "ScriptHost.h"

#include "frontends/windows/automation/com/Module.h"
#include "frontends/windows/automation/control/ConnectionPoint.h"

#include <Zandor/Interface.h>
#include <Zandor/Query.h>

#include <gtest/gtest.h>

#include <fstream>
#include <iterator>

using namespace zandor;
using namespace zandor::automation;
using TalvikDBxZandor::Event;
using Lines = std::vector<std::string>;

namespace {

/// Says what class it is, as the control does, and raises whatever event a test wants.
class Source final : public IDispatch, public IProvideClassInfo, public IConnectionPointContainer {
public:
    ConnectionPoint events{*this};

    STDMETHODIMP QueryInterface(REFIID iid, void** object) override {
        if (iid == IID_IUnknown || iid == IID_IDispatch)
            *object = static_cast<IDispatch*>(this);
        else if (iid == IID_IProvideClassInfo)
            *object = static_cast<IProvideClassInfo*>(this);
        else if (iid == IID_IConnectionPointContainer)
            *object = static_cast<IConnectionPointContainer*>(this);
        else
            *object = nullptr;
        return *object ? S_OK : E_NOINTERFACE;
    }
    // Of the test's, which outlives whoever uses it.
    STDMETHODIMP_(ULONG) AddRef() override { return 2; }
    STDMETHODIMP_(ULONG) Release() override { return 1; }
    STDMETHODIMP GetTypeInfoCount(UINT* count) override { return *count = 0, S_OK; }
    STDMETHODIMP GetTypeInfo(UINT, LCID, ITypeInfo**) override { return E_NOTIMPL; }
    STDMETHODIMP GetIDsOfNames(REFIID, LPOLESTR*, UINT, LCID, DISPID*) override {
        return DISP_E_UNKNOWNNAME;
    }
    STDMETHODIMP Invoke(DISPID, REFIID, LCID, WORD, DISPPARAMS*, VARIANT*, EXCEPINFO*,
                        UINT*) override {
        return DISP_E_MEMBERNOTFOUND;
    }
    STDMETHODIMP GetClassInfo(ITypeInfo** info) override {
        return Held<IProvideClassInfo>::of(newControl().get())->GetClassInfo(info);
    }
    STDMETHODIMP EnumConnectionPoints(IEnumConnectionPoints**) override { return E_NOTIMPL; }
    STDMETHODIMP FindConnectionPoint(REFIID iid, IConnectionPoint** point) override {
        if (iid != ids::controlEvents) return CONNECT_E_NOCONNECTION;
        *point = &events;
        return S_OK;
    }
};

class TheEventsInAScript : public testing::Test {
protected:
    // What is compiled into this program has its type libraries where the library has them.
    TheEventsInAScript() { module::remember(Dll::get().module()); }

    /// Every event once, each with what it carries.
    void raiseAll() {
        TalvikDBxZandor::EventArguments given;
        const auto definition = platform::makeRef<model::ColumnDefinition>();
        definition->Synonym(u"who");
        given.Definition = definition;
        const auto join = platform::makeRef<model::Join>();
        join->JoinType(2);
        given.Join = join;
        given.Text = u"New Zanodr is nothing!";
        given.Number = -1;
        for (const auto& event : TalvikDBxZandor::automation::events())
            source.events.raise(event.number, given);
    }

    static std::wstring textOf(const char* path) {
        std::ifstream file(path);
        const std::string bytes{std::istreambuf_iterator<char>(file), {}};
        return {bytes.begin(), bytes.end()};
    }

    Source source;
};

const wchar_t inVBScript[] = LR"(
Sub On_TableDeleted() : WScript.Echo "TableDeleted" : End Sub
Sub On_TableMoved() : WScript.Echo "TableMoved" : End Sub
Sub On_Activate() : WScript.Echo "Activate" : End Sub
Sub On_ColumnCreated(d) : WScript.Echo "ColumnCreated " & d.Synonym : End Sub
Sub On_ColumnModified(d) : WScript.Echo "ColumnModified " & d.Synonym : End Sub
Sub On_ColumnRemoved(d) : WScript.Echo "ColumnRemoved " & d.Synonym : End Sub
Sub On_Error(text, number) : WScript.Echo "Error " & text & " " & number : End Sub
Sub On_JoinCreated(j) : WScript.Echo "JoinCreated " & j.JoinType : End Sub
Sub On_JoinModified(j) : WScript.Echo "JoinModified " & j.JoinType : End Sub
Sub On_JoinRemoved(j) : WScript.Echo "JoinRemoved " & j.JoinType : End Sub
WScript.ConnectObject control, "On_"
)";

const wchar_t inJScript[] = LR"(
function On_TableDeleted() { WScript.Echo("TableDeleted"); }
function On_TableMoved() { WScript.Echo("TableMoved"); }
function On_Activate() { WScript.Echo("Activate"); }
function On_ColumnCreated(d) { WScript.Echo("ColumnCreated " + d.Synonym); }
function On_ColumnModified(d) { WScript.Echo("ColumnModified " + d.Synonym); }
function On_ColumnRemoved(d) { WScript.Echo("ColumnRemoved " + d.Synonym); }
function On_Error(text, number) { WScript.Echo("Error " + text + " " + number); }
function On_JoinCreated(j) { WScript.Echo("JoinCreated " + j.JoinType); }
function On_JoinModified(j) { WScript.Echo("JoinModified " + j.JoinType); }
function On_JoinRemoved(j) { WScript.Echo("JoinRemoved " + j.JoinType); }
WScript.ConnectObject(control, "On_");
)";

const Lines allOfThem = {"TableDeleted",
                         "TableMoved",
                         "Activate",
                         "ColumnCreated who",
                         "ColumnModified who",
                         "ColumnRemoved who",
                         "Error New Zanodr is nothing! -1",
                         "JoinCreated 2",
                         "JoinModified 2",
                         "JoinRemoved 2"};

} // namespace

TEST_F(TheEventsInAScript, AreProceduresOfVBScriptWithTheirArguments) {
    ScriptHost script(L"VBScript");
    script.lend(L"control", &source);
    ASSERT_TRUE(script.run(inVBScript)) << script.failure();
    raiseAll();
    EXPECT_EQ(script.said(), allOfThem);
}

TEST_F(TheEventsInAScript, AreFunctionsOfJScriptWithTheirArguments) {
    ScriptHost script(L"JScript");
    script.lend(L"control", &source);
    ASSERT_TRUE(script.run(inJScript)) << script.failure();
    raiseAll();
    EXPECT_EQ(script.said(), allOfThem);
}

TEST_F(TheEventsInAScript, AreNotMissedWhereThereIsNoProcedure) {
    ScriptHost script(L"VBScript");
    script.lend(L"control", &source);
    ASSERT_TRUE(script.run(L"Sub On_TableMoved() : WScript.Echo \"moved\" : End Sub\n"
                           L"WScript.ConnectObject control, \"On_\""))
        << script.failure();
    raiseAll();
    EXPECT_EQ(script.said(), Lines{"moved"});
}

TEST_F(TheEventsInAScript, OfAControlThatWasMadeWithAPrefixAreThoseOfTheExample) {
    ScriptHost script(L"VBScript");
    ASSERT_TRUE(script.run(textOf(ZANDOR_EXAMPLES_WINDOWS "/events.vbs"))) << script.failure();
    EXPECT_EQ(script.said(), Lines{"New Zanodr is nothing! (-1)"});
}

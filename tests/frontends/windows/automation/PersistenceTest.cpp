#include "Dll.h"
#include "Late.h"

#include <Zandor/Interface.h>

#include <gtest/gtest.h>

#include <map>

using namespace zandor;
using namespace zandor::automation;
using TalvikDBxZandor::automation::Member;
using TalvikDBxZandor::automation::Setter;

namespace {

using Texts = std::map<std::wstring, std::string>;

std::vector<std::wstring> writtenMembers() {
    std::vector<std::wstring> names;
    for (const Member& member : TalvikDBxZandor::automation::members())
        if (member.setter == Setter::byValue || member.setter == Setter::byReference)
            names.emplace_back(reinterpret_cast<const wchar_t*>(member.name.data()),
                               member.name.size());
    return names;
}

Texts valuesOf(const Held<_Zandor>& control) {
    Texts values;
    for (const std::wstring& name : writtenMembers())
        values[name] = Late(control.get()).get(name.c_str()).text();
    return values;
}

/// A control each of whose texts and flags is another one than at first.
Held<_Zandor> changedControl() {
    const auto control = newControl();
    const Late late(control.get());
    for (const std::wstring& name : writtenMembers()) {
        const VARTYPE kind = late.get(name.c_str()).value.vt;
        Outcome written;
        if (kind == VT_BOOL) written = late.put(name.c_str(), false);
        if (kind == VT_BSTR)
            written = late.put(name.c_str(), platform::StringView(u"\u00DCber\0 all", 9));
        EXPECT_TRUE(written);
    }
    EXPECT_TRUE(late.put(L"JoinModifyDisabled", std::int16_t{-3}));
    EXPECT_TRUE(late.put(L"MXHorzFrameSize", std::int16_t{12345}));
    return control;
}

std::vector<char> bytesIn(IStream* stream) {
    HGLOBAL memory = nullptr;
    GetHGlobalFromStream(stream, &memory);
    STATSTG about{};
    stream->Stat(&about, STATFLAG_NONAME);
    const char* const begin = static_cast<const char*>(GlobalLock(memory));
    std::vector<char> bytes(begin, begin + about.cbSize.QuadPart);
    GlobalUnlock(memory);
    return bytes;
}

Held<IStream> streamOf(const std::vector<char>& bytes) {
    Held<IStream> stream;
    CreateStreamOnHGlobal(nullptr, TRUE, stream.slot());
    stream->Write(bytes.data(), static_cast<ULONG>(bytes.size()), nullptr);
    stream->Seek({}, STREAM_SEEK_SET, nullptr);
    return stream;
}

std::vector<char> saved(const Held<_Zandor>& control) {
    const auto stream = streamOf({});
    EXPECT_EQ(Held<IPersistStreamInit>::of(control.get())->Save(stream.get(), TRUE), S_OK);
    return bytesIn(stream.get());
}

HRESULT loaded(const Held<_Zandor>& control, const std::vector<char>& bytes) {
    return Held<IPersistStreamInit>::of(control.get())->Load(streamOf(bytes).get());
}

/// What a host writes its forms by: names and values.
class Bag final : public IPropertyBag {
public:
    std::map<std::wstring, Value> values;

    STDMETHODIMP QueryInterface(REFIID iid, void** object) override {
        *object = iid == IID_IUnknown || iid == IID_IPropertyBag ? this : nullptr;
        return *object ? S_OK : E_NOINTERFACE;
    }
    STDMETHODIMP_(ULONG) AddRef() override { return 2; }
    STDMETHODIMP_(ULONG) Release() override { return 1; }
    STDMETHODIMP Read(LPCOLESTR name, VARIANT* value, IErrorLog*) override {
        const auto found = values.find(name);
        return found == values.end() ? E_INVALIDARG : VariantCopy(value, &found->second);
    }
    STDMETHODIMP Write(LPCOLESTR name, VARIANT* value) override {
        return VariantCopy(&values[name], value);
    }
};

HRESULT loaded(const Held<_Zandor>& control, Bag& bag) {
    return Held<IPersistPropertyBag>::of(control.get())->Load(&bag, nullptr);
}

} // namespace

TEST(AControlThatIsKept, ComesBackFromAStreamWithAllThatWasWritten) {
    const auto before = changedControl();
    const auto after = newControl();
    ASSERT_NE(valuesOf(before), valuesOf(after));
    ASSERT_EQ(loaded(after, saved(before)), S_OK);
    EXPECT_EQ(valuesOf(after), valuesOf(before));
    EXPECT_EQ(saved(after), saved(before));
}

TEST(AControlThatIsKept, IsAsLargeAsItSaysAndLeavesTheStreamBehindItself) {
    const auto control = changedControl();
    auto bytes = saved(control);
    ULARGE_INTEGER size{};
    ASSERT_EQ(Held<IPersistStreamInit>::of(control.get())->GetSizeMax(&size), S_OK);
    EXPECT_EQ(size.QuadPart, bytes.size());
    bytes.push_back('!');
    const auto stream = streamOf(bytes);
    ASSERT_EQ(Held<IPersistStreamInit>::of(newControl().get())->Load(stream.get()), S_OK);
    char next = 0;
    EXPECT_EQ(stream->Read(&next, 1, nullptr), S_OK);
    EXPECT_EQ(next, '!');
}

TEST(AControlThatIsKept, RefusesAStreamThatIsCutAnywhereAndStaysAsItWas) {
    const auto bytes = saved(changedControl());
    const auto control = newControl();
    const Texts before = valuesOf(control);
    for (std::size_t length = 0; length < bytes.size(); length += length < 40 ? 1 : 97)
        EXPECT_HRESULT_FAILED(loaded(control, {bytes.begin(), bytes.begin() + length})) << length;
    EXPECT_EQ(valuesOf(control), before);
    EXPECT_EQ(Held<IPersistStreamInit>::of(control.get())->InitNew(), S_OK);
}

TEST(AControlThatIsKept, RefusesAStreamInWhichAnythingIsAnother) {
    const auto bytes = saved(changedControl());
    const auto control = newControl();
    const Texts before = valuesOf(control);
    for (std::size_t place = 0; place < bytes.size(); place += place < 40 ? 1 : 61) {
        auto broken = bytes;
        broken[place] = static_cast<char>(broken[place] ^ 0x10);
        EXPECT_HRESULT_FAILED(loaded(control, broken)) << place;
    }
    EXPECT_EQ(valuesOf(control), before);
}

TEST(AControlThatIsKept, SaysWhyAStreamIsNotItsOwn) {
    auto bytes = saved(newControl());
    const auto control = newControl();
    EXPECT_EQ(loaded(control, {'n', 'o', 'n', 'e'}), STG_E_INVALIDHEADER);
    bytes[4] = 2; // the version
    EXPECT_EQ(loaded(control, bytes), STG_E_OLDDLL);
}

TEST(AControlThatIsKept, IsChangedUntilItIsSaved) {
    const auto control = newControl();
    const auto persistent = Held<IPersistStreamInit>::of(control.get());
    saved(control);
    EXPECT_EQ(persistent->IsDirty(), S_FALSE);
    Late(control.get()).put(L"LNGJoinOk", platform::StringView(u"Gut"));
    EXPECT_EQ(persistent->IsDirty(), S_OK);
    EXPECT_EQ(persistent->Save(streamOf({}).get(), FALSE), S_OK); // a copy
    EXPECT_EQ(persistent->IsDirty(), S_OK);
    EXPECT_EQ(persistent->Save(streamOf({}).get(), TRUE), S_OK);
    EXPECT_EQ(persistent->IsDirty(), S_FALSE);
}

TEST(AControlThatIsKept, ComesBackFromABagOfNamesAndValues) {
    const auto before = changedControl();
    Bag bag;
    ASSERT_EQ(Held<IPersistPropertyBag>::of(before.get())->Save(&bag, TRUE, TRUE), S_OK);
    EXPECT_EQ(bag.values.size(), writtenMembers().size());
    EXPECT_EQ(bag.values[L"JoinModifyDisabled"].iVal, -3);
    const auto after = newControl();
    ASSERT_EQ(loaded(after, bag), S_OK);
    EXPECT_EQ(valuesOf(after), valuesOf(before));
}

TEST(AControlThatIsKept, WritesNoMoreIntoABagThanIsAnotherThanAtFirst) {
    const auto control = newControl(); // whose traces are off
    Late(control.get()).put(L"UseJoinCompareOperatorLE", false);
    Bag bag;
    ASSERT_EQ(Held<IPersistPropertyBag>::of(control.get())->Save(&bag, TRUE, FALSE), S_OK);
    std::vector<std::wstring> names;
    for (const auto& [name, value] : bag.values) names.push_back(name);
    EXPECT_EQ(names, (std::vector<std::wstring>{L"DebugSwitch", L"UseJoinCompareOperatorLE",
                                                L"UseJoinCompareOperatorLessEquals"}));
}

TEST(AControlThatIsKept, TakesWhatABagHasAndTheRestAsAtFirst) {
    Bag bag;
    bag.values[L"DebugSwitch"] = Value(platform::StringView(u"0")); // as a file may have it
    bag.values[L"UseJoinCompareOperatorLessEquals"] = Value(false);
    bag.values[L"UseJoinCompareOperatorGE"] = Value(false);
    const auto control = Dll::get().make<_Zandor>(ids::control);
    ASSERT_EQ(loaded(control, bag), S_OK);
    const Late late(control.get());
    EXPECT_EQ(late.get(L"DebugSwitch").value.iVal, 0);
    EXPECT_EQ(late.get(L"UseJoinCompareOperatorLE").value.boolVal, VARIANT_FALSE);
    EXPECT_EQ(late.get(L"UseJoinCompareOperatorGreaterEquals").value.boolVal, VARIANT_FALSE);
    EXPECT_EQ(late.get(L"LNGJoinOk").text(), "&Ok");
}

TEST(AControlThatIsKept, RefusesABagWithAValueThatCannotBeAndStaysAsItWas) {
    const std::pair<const wchar_t*, Value> impossible[] = {
        {L"MXHorzFrameSize", Value(std::int32_t{40000})},
        {L"UseJoinTypeLeft", Value(platform::StringView(u"perhaps"))},
        {L"LNGJoinOk", Value(Held<IDispatch>())},
        {L"HorizontalScrollbarPos", Value(std::int16_t{-1})},
        {L"VerticalScrollbarPos", Value(std::int16_t{32767})}};
    const auto control = newControl();
    const Texts before = valuesOf(control);
    for (const auto& [name, value] : impossible) {
        Bag bag;
        bag.values[L"LNGJoinForm"] = Value(platform::StringView(u"another"));
        VariantCopy(&bag.values[name], const_cast<Value*>(&value));
        EXPECT_HRESULT_FAILED(loaded(control, bag)) << value.vt;
    }
    EXPECT_EQ(valuesOf(control), before);
}

TEST(AControlThatIsKept, IsNotNewAgain) {
    const auto control = newControl();
    const auto persistent = Held<IPersistStreamInit>::of(control.get());
    EXPECT_EQ(persistent->InitNew(), S_OK);
    ASSERT_EQ(loaded(control, saved(control)), S_OK);
    EXPECT_EQ(persistent->InitNew(), E_UNEXPECTED);
    CLSID id{};
    EXPECT_EQ(Held<IPersist>::of(control.get())->GetClassID(&id), S_OK);
    EXPECT_EQ(id, ids::control);
}

TEST(AControlThatIsKept, StandsHostilesWhoGiveItNothing) {
    const auto control = newControl();
    const auto streams = Held<IPersistStreamInit>::of(control.get());
    const auto bags = Held<IPersistPropertyBag>::of(control.get());
    EXPECT_EQ(streams->Load(nullptr), E_POINTER);
    EXPECT_EQ(streams->Save(nullptr, TRUE), E_POINTER);
    EXPECT_EQ(streams->GetSizeMax(nullptr), E_POINTER);
    EXPECT_EQ(streams->GetClassID(nullptr), E_POINTER);
    EXPECT_EQ(bags->Load(nullptr, nullptr), E_POINTER);
    EXPECT_EQ(bags->Save(nullptr, TRUE, TRUE), E_POINTER);
}

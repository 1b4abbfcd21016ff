#include <Zandor/Interface.h>

namespace TalvikDBxZandor::automation {

using platform::Variant;

namespace {

template <class T>
const T& valueOf(const Variant& value) {
    if (const T* const held = std::get_if<T>(&value)) return *held;
    throw platform::errors::typeMismatch();
}

/// The model in a value. Nothing of whatever type is no model, which the control has words for.
platform::Ref<TalvikZandorLib::Zandor> modelOf(const Variant& value) {
    if (const auto* object = std::get_if<std::shared_ptr<void>>(&value); object && !*object)
        return {};
    return valueOf<platform::Ref<TalvikZandorLib::Zandor>>(value);
}

using Arguments = std::span<const Variant>;

/// The text at a place among exactly so many arguments.
const platform::String& textAt(Arguments arguments, std::size_t place, std::size_t count) {
    if (arguments.size() != count) throw platform::errors::wrongNumberOfArguments();
    return valueOf<platform::String>(arguments[place]);
}

template <class T>
constexpr Type typeOf() {
    if constexpr (std::is_same_v<T, bool>)
        return Type::Boolean;
    else if constexpr (std::is_same_v<T, std::int16_t>)
        return Type::Integer;
    else
        return Type::String;
}

/// A plain data member of the control.
template <auto Pointer>
constexpr Member field(std::uint32_t dispatchId, platform::StringView name) {
    using T = std::remove_cvref_t<decltype(std::declval<Zandor&>().*Pointer)>;
    return {dispatchId,
            name,
            Kind::field,
            typeOf<T>(),
            Setter::byValue,
            {},
            {},
            [](Zandor& zandor) -> Variant { return zandor.*Pointer; },
            [](Zandor& zandor, const Variant& value) { zandor.*Pointer = valueOf<T>(value); }};
}

constexpr Parameter selectColumnNames[] = {{u"TabName", true}, {u"ColName", true}};
constexpr Parameter setCurrentTable[] = {{u"TabName", false}};

using Boolean = bool;
using Integer = std::int16_t;

// A property procedure is an overloaded member function, so a row cannot name it as an argument.
// clang-format off
#define ACCESSORS(id, name, type, setter) \
    Member{id, u"" #name, Kind::property, Type::type, Setter::setter, report::name.get, report::name.let, \
           [](Zandor& zandor) -> Variant { return zandor.name(); }, \
           [](Zandor& zandor, const Variant& value) { zandor.name(valueOf<type>(value)); }}
#define GETTER(id, name, type) \
    Member{id, u"" #name, Kind::property, Type::type, Setter::none, report::name.get, {}, \
           [](Zandor& zandor) -> Variant { return zandor.name(); }}
#define METHOD(id, name, parameters, ...) \
    Member{id, u"" #name, Kind::method, Type::none, Setter::none, {}, {}, nullptr, nullptr, parameters, \
           [](Zandor& zandor, Arguments arguments) __VA_ARGS__}

const Member table[] = {
    field<&Zandor::LNGJoinForm>(0x4003000E, u"LNGJoinForm"),
    field<&Zandor::LNGJoinLeftTable>(0x4003000F, u"LNGJoinLeftTable"),
    field<&Zandor::LNGJoinLeftColumn>(0x40030010, u"LNGJoinLeftColumn"),
    field<&Zandor::LNGJoinRightTable>(0x40030011, u"LNGJoinRightTable"),
    field<&Zandor::LNGJoinRightColumn>(0x40030012, u"LNGJoinRightColumn"),
    field<&Zandor::LNGJoinType>(0x40030013, u"LNGJoinType"),
    field<&Zandor::LNGJoinTypeNormal>(0x40030014, u"LNGJoinTypeNormal"),
    field<&Zandor::LNGJoinTypeLeftOuter>(0x40030015, u"LNGJoinTypeLeftOuter"),
    field<&Zandor::LNGJoinTypeRightOuter>(0x40030016, u"LNGJoinTypeRightOuter"),
    field<&Zandor::LNGJoinTypeBothOuter>(0x40030017, u"LNGJoinTypeBothOuter"),
    field<&Zandor::LNGJoinOk>(0x40030018, u"LNGJoinOk"),
    field<&Zandor::LNGJoinCancel>(0x40030019, u"LNGJoinCancel"),
    field<&Zandor::LNGMnuShowJoinDef>(0x4003001A, u"LNGMnuShowJoinDef"),
    field<&Zandor::LNGMnuDelJoin>(0x4003001B, u"LNGMnuDelJoin"),
    field<&Zandor::LNGMnuCopyCol>(0x4003001C, u"LNGMnuCopyCol"),
    field<&Zandor::LNGMnuCreateJoin>(0x4003001D, u"LNGMnuCreateJoin"),
    field<&Zandor::LNGMnuDelTable>(0x4003001E, u"LNGMnuDelTable"),
    field<&Zandor::LNGMnuPasteCol>(0x4003001F, u"LNGMnuPasteCol"),
    field<&Zandor::LNGMnuDelCol>(0x40030020, u"LNGMnuDelCol"),
    field<&Zandor::LNGSpreadField>(0x40030021, u"LNGSpreadField"),
    field<&Zandor::LNGSpreadSynonym>(0x40030022, u"LNGSpreadSynonym"),
    field<&Zandor::LNGSpreadSort>(0x40030023, u"LNGSpreadSort"),
    field<&Zandor::LNGSpreadVisible>(0x40030024, u"LNGSpreadVisible"),
    field<&Zandor::LNGSpreadCriteria>(0x40030025, u"LNGSpreadCriteria"),
    field<&Zandor::LNGSpreadOr>(0x40030026, u"LNGSpreadOr"),
    field<&Zandor::LNGMnuShowJoinDefVis>(0x40030027, u"LNGMnuShowJoinDefVis"),
    field<&Zandor::LNGMnuDelJoinVis>(0x40030028, u"LNGMnuDelJoinVis"),
    field<&Zandor::LNGMnuCopyColVis>(0x40030029, u"LNGMnuCopyColVis"),
    field<&Zandor::LNGMnuCreateJoinVis>(0x4003002A, u"LNGMnuCreateJoinVis"),
    field<&Zandor::LNGMnuDelTableVis>(0x4003002B, u"LNGMnuDelTableVis"),
    field<&Zandor::LNGMnuPasteColVis>(0x4003002C, u"LNGMnuPasteColVis"),
    field<&Zandor::LNGMnuDelColVis>(0x4003002D, u"LNGMnuDelColVis"),
    field<&Zandor::LNGMnuSep1Vis>(0x4003002E, u"LNGMnuSep1Vis"),
    field<&Zandor::LNGMnuSep2Vis>(0x4003002F, u"LNGMnuSep2Vis"),
    field<&Zandor::MXHorzFrameSize>(0x40030030, u"MXHorzFrameSize"),
    field<&Zandor::MXVertFrameSize>(0x40030031, u"MXVertFrameSize"),
    field<&Zandor::DeletedTable>(0x40030032, u"DeletedTable"),
    ACCESSORS(0x68030018, DebugSwitch, Integer, byReference),
    ACCESSORS(0x68030017, JoinModifyDisabled, Integer, byValue),
    ACCESSORS(0x68030016, VisibleFrameLeft, Integer, byValue),
    ACCESSORS(0x68030015, VisibleFrameTop, Integer, byReference),
    Member{0x68030014, u"Zandor", Kind::property, Type::Zandor, Setter::object, report::Zandor.get, report::Zandor.let,
           [](Zandor& zandor) -> Variant { return zandor.P_GET_Zandor(); },
           [](Zandor& zandor, const Variant& value) { zandor.P_SET_Zandor(modelOf(value)); }},
    ACCESSORS(0x68030013, HorizMaxScrollPos, Integer, byValue),
    ACCESSORS(0x68030012, VertMaxScrollPos, Integer, byValue),
    ACCESSORS(0x68030011, HorizontalScrollbarPos, Integer, byValue),
    ACCESSORS(0x68030010, VerticalScrollbarPos, Integer, byValue),
    ACCESSORS(0x6803000F, OnlyJoin, Boolean, byValue),
    ACCESSORS(0x6803000E, UseJoinTypeNormal, Boolean, byValue),
    ACCESSORS(0x6803000D, UseJoinTypeLeft, Boolean, byValue),
    ACCESSORS(0x6803000C, UseJoinTypeRight, Boolean, byValue),
    ACCESSORS(0x6803000B, UseJoinTypeBoth, Boolean, byValue),
    ACCESSORS(0x6803000A, UseJoinCompareOperatorEquals, Boolean, byValue),
    ACCESSORS(0x68030009, UseJoinCompareOperatorNotEquals, Boolean, byValue),
    ACCESSORS(0x68030008, UseJoinCompareOperatorLess, Boolean, byValue),
    ACCESSORS(0x68030007, UseJoinCompareOperatorGreater, Boolean, byValue),
    ACCESSORS(0x68030006, UseJoinCompareOperatorLessEquals, Boolean, byValue),
    ACCESSORS(0x68030005, UseJoinCompareOperatorGreaterEquals, Boolean, byValue),
    ACCESSORS(0x68030004, UseJoinCompareOperatorLE, Boolean, byValue),
    ACCESSORS(0x68030003, UseJoinCompareOperatorGE, Boolean, byValue),
    GETTER(0x68030002, lastjoin, ZDJoin),
    GETTER(0x68030001, activetable, ZDTable),
    GETTER(0x68030000, ActiveColumn, ZDColumn),
    METHOD(0x6003005F, Terminate, {}, { if (!arguments.empty()) throw platform::errors::wrongNumberOfArguments(); zandor.Terminate(); }),
    METHOD(0x60030061, SelectColumnNames, selectColumnNames, { zandor.SelectColumnNames(textAt(arguments, 0, 2), textAt(arguments, 1, 2)); }),
    METHOD(0x60030062, SetCurrentTable, setCurrentTable, { zandor.SetCurrentTable(textAt(arguments, 0, 1)); }),
};

#undef ACCESSORS
#undef GETTER
#undef METHOD
// clang-format on

constexpr EventMember eventTable[] = {
    {Event::TableDeleted, u"TableDeleted", Carries::nothing},
    {Event::TableMoved, u"TableMoved", Carries::nothing},
    {Event::Activate, u"Activate", Carries::nothing},
    {Event::ColumnCreated, u"ColumnCreated", Carries::definition},
    {Event::ColumnModified, u"ColumnModified", Carries::definition},
    {Event::ColumnRemoved, u"ColumnRemoved", Carries::definition},
    {Event::Error, u"Error", Carries::textAndNumber},
    {Event::JoinCreated, u"JoinCreated", Carries::join},
    {Event::JoinModified, u"JoinModified", Carries::join},
    {Event::JoinRemoved, u"JoinRemoved", Carries::join},
};

} // namespace

std::span<const Member> members() { return table; }

std::span<const EventMember> events() { return eventTable; }

} // namespace TalvikDBxZandor::automation

#pragma once

#include <Zandor/Interface.h>

#include <string_view>
#include <variant>

/// The public interface as hosts were promised it, written out by hand: what the tests hold the
/// interface table, the control's report names and its front ends against.
namespace promised {

using Type = TalvikDBxZandor::automation::Type;
using Setter = TalvikDBxZandor::automation::Setter;
using Carries = TalvikDBxZandor::automation::Carries;
using Text = std::u16string_view;

/// A plain value; its default tells its type.
struct Field {
    std::uint32_t dispatchId;
    Text name;
    std::variant<Text, bool, std::int16_t> byDefault;
};

struct Property {
    std::uint32_t dispatchId;
    Text name;
    Type type;
    Setter setter;
    Text getterReport;
    Text setterReport;
};

struct Method {
    std::uint32_t dispatchId;
    Text name;
    Text parameters; ///< "TabName&, ColName&": an ampersand behind one passed by reference
};

struct Event {
    std::int16_t number;
    Text name;
    Carries carries;
};

// clang-format off
inline constexpr Field fields[] = {
    {0x4003000E, u"LNGJoinForm", Text(u"Join Defintion")},
    {0x4003000F, u"LNGJoinLeftTable", Text(u"Left Table:")},
    {0x40030010, u"LNGJoinLeftColumn", Text(u"Left Column:")},
    {0x40030011, u"LNGJoinRightTable", Text(u"Right Table:")},
    {0x40030012, u"LNGJoinRightColumn", Text(u"Right Column:")},
    {0x40030013, u"LNGJoinType", Text(u"Join Type")},
    {0x40030014, u"LNGJoinTypeNormal", Text(u"Normal")},
    {0x40030015, u"LNGJoinTypeLeftOuter", Text(u"Left Outer")},
    {0x40030016, u"LNGJoinTypeRightOuter", Text(u"Right Outer")},
    {0x40030017, u"LNGJoinTypeBothOuter", Text(u"Both Outer")},
    {0x40030018, u"LNGJoinOk", Text(u"&Ok")},
    {0x40030019, u"LNGJoinCancel", Text(u"&Cancel")},
    {0x4003001A, u"LNGMnuShowJoinDef", Text(u"Show Join Definition")},
    {0x4003001B, u"LNGMnuDelJoin", Text(u"Delete Join")},
    {0x4003001C, u"LNGMnuCopyCol", Text(u"Copy Column")},
    {0x4003001D, u"LNGMnuCreateJoin", Text(u"Create Join")},
    {0x4003001E, u"LNGMnuDelTable", Text(u"Delete Table")},
    {0x4003001F, u"LNGMnuPasteCol", Text(u"Paste Column")},
    {0x40030020, u"LNGMnuDelCol", Text(u"Delete Coumn")},
    {0x40030021, u"LNGSpreadField", Text(u"Field:")},
    {0x40030022, u"LNGSpreadSynonym", Text(u"Synonym:")},
    {0x40030023, u"LNGSpreadSort", Text(u"Sort:")},
    {0x40030024, u"LNGSpreadVisible", Text(u"Visible:")},
    {0x40030025, u"LNGSpreadCriteria", Text(u"Criteria:")},
    {0x40030026, u"LNGSpreadOr", Text(u"Or:")},
    {0x40030027, u"LNGMnuShowJoinDefVis", true},
    {0x40030028, u"LNGMnuDelJoinVis", true},
    {0x40030029, u"LNGMnuCopyColVis", true},
    {0x4003002A, u"LNGMnuCreateJoinVis", true},
    {0x4003002B, u"LNGMnuDelTableVis", true},
    {0x4003002C, u"LNGMnuPasteColVis", true},
    {0x4003002D, u"LNGMnuDelColVis", true},
    {0x4003002E, u"LNGMnuSep1Vis", true},
    {0x4003002F, u"LNGMnuSep2Vis", true},
    {0x40030030, u"MXHorzFrameSize", std::int16_t{16000}},
    {0x40030031, u"MXVertFrameSize", std::int16_t{16000}},
    {0x40030032, u"DeletedTable", Text(u"  ")},
};

inline constexpr Property properties[] = {
    {0x68030018, u"DebugSwitch", Type::Integer, Setter::byReference, u"P_GET DebugSwitch", u"P_LET DebugSwitch"},
    {0x68030017, u"JoinModifyDisabled", Type::Integer, Setter::byValue, u"P_GET JoinModifyDisabled", u"P_LET JoinModifyDisabled"},
    {0x68030016, u"VisibleFrameLeft", Type::Integer, Setter::byValue, u"P_GET VisibleFrameLeft", u"P_LET VisibleFrameLeft"},
    {0x68030015, u"VisibleFrameTop", Type::Integer, Setter::byReference, u"P_GET VisibleFrameTop", u"P_LET VisibleFrameTop"},
    {0x68030014, u"Zandor", Type::Zandor, Setter::object, u"P_GET Zandor", u"P_SET Zandor"},
    {0x68030013, u"HorizMaxScrollPos", Type::Integer, Setter::byValue, u"P_GET HorizMaxScrollPos", u"P_LET HorizMaxScrollPos"},
    {0x68030012, u"VertMaxScrollPos", Type::Integer, Setter::byValue, u"P_GET VertMaxScrollPos", u"P_LET VertMaxScrollPos"},
    {0x68030011, u"HorizontalScrollbarPos", Type::Integer, Setter::byValue, u"P_GET HorizontalScrollbarPos", u"P_LET HorizontalScrollbarPos"},
    {0x68030010, u"VerticalScrollbarPos", Type::Integer, Setter::byValue, u"P_GET VerticalScrollbarPos", u"P_LET VerticalScrollbarPos"},
    {0x6803000F, u"OnlyJoin", Type::Boolean, Setter::byValue, u"P_GET OnlyJoin", u"P_LET OnlyJoin"},
    {0x6803000E, u"UseJoinTypeNormal", Type::Boolean, Setter::byValue, u"P_GET UseJoinTypeNormal", u"P_LET UseJoinTypeNormal"},
    {0x6803000D, u"UseJoinTypeLeft", Type::Boolean, Setter::byValue, u"P_GET UseJoinTypeLeft", u"P_LET UseJoinTypeLeft"},
    {0x6803000C, u"UseJoinTypeRight", Type::Boolean, Setter::byValue, u"P_GET UseJoinTypeRight", u"P_LET UseJoinTypeRight"},
    {0x6803000B, u"UseJoinTypeBoth", Type::Boolean, Setter::byValue, u"P_GET UseJoinTypeBoth", u"P_LET UseJoinTypeBoth"},
    {0x6803000A, u"UseJoinCompareOperatorEquals", Type::Boolean, Setter::byValue, u"P_GET UseJoinCompareOperatorEquals", u"P_LET UseJoinCompareOperatorEquals"},
    {0x68030009, u"UseJoinCompareOperatorNotEquals", Type::Boolean, Setter::byValue, u"P_GET UseJoinCompareOperatorNotEquals", u"P_LET UseJoinCompareOperatorNotEquals"},
    {0x68030008, u"UseJoinCompareOperatorLess", Type::Boolean, Setter::byValue, u"P_GET UseJoinCompareOperatorLess", u"P_LET UseJoinCompareOperatorLess"},
    {0x68030007, u"UseJoinCompareOperatorGreater", Type::Boolean, Setter::byValue, u"P_GET UseJoinCompareOperatorGreater", u"P_LET UseJoinCompareOperatorGreater"},
    {0x68030006, u"UseJoinCompareOperatorLessEquals", Type::Boolean, Setter::byValue, u"P_GET UseJoinCompareOperatorLessEquals", u"P_LET UseJoinCompareOperatorLessEquals"},
    {0x68030005, u"UseJoinCompareOperatorGreaterEquals", Type::Boolean, Setter::byValue, u"P_GET UseJoinCompareOperatorGreaterEquals", u"P_LET UseJoinCompareOperatorGreaterEquals"},
    {0x68030004, u"UseJoinCompareOperatorLE", Type::Boolean, Setter::byValue, u"P_GET UseJoinCompareOperatorLessEquals", u"P_LET UseJoinCompareOperatorLE"},
    {0x68030003, u"UseJoinCompareOperatorGE", Type::Boolean, Setter::byValue, u"P_GET UseJoinCompareOperatorGE", u"P_LET UseJoinCompareOperatorGreaterEquals"},
    {0x68030002, u"lastjoin", Type::ZDJoin, Setter::none, u"P_GET lastjoin", u""},
    {0x68030001, u"activetable", Type::ZDTable, Setter::none, u"P_GET activetable", u""},
    {0x68030000, u"ActiveColumn", Type::ZDColumn, Setter::none, u"P_GET activecolumn", u""},
};

inline constexpr Method methods[] = {
    {0x6003005F, u"Terminate", u""},
    {0x60030061, u"SelectColumnNames", u"TabName&, ColName&"},
    {0x60030062, u"SetCurrentTable", u"TabName"},
};

inline constexpr Event events[] = {
    {-120, u"TableDeleted", Carries::nothing},
    {-121, u"TableMoved", Carries::nothing},
    {-122, u"Activate", Carries::nothing},
    {-123, u"ColumnCreated", Carries::definition},
    {-124, u"ColumnModified", Carries::definition},
    {-125, u"ColumnRemoved", Carries::definition},
    {-126, u"Error", Carries::textAndNumber},
    {-127, u"JoinCreated", Carries::join},
    {-128, u"JoinModified", Carries::join},
    {-129, u"JoinRemoved", Carries::join},
};
// clang-format on

static_assert(std::size(fields) == 37);
static_assert(std::size(properties) == 25);
static_assert(std::size(methods) == 3);
static_assert(std::size(events) == 10);

} // namespace promised

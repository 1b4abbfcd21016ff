#pragma once

#include <Zandor/platform/String.h>

/// The names that the property procedures report under, for the control and for the description of
/// its interface. Some are crossed; hosts' logs know them so.
namespace TalvikDBxZandor::report {

struct Property {
    zandor::platform::StringView get;
    zandor::platform::StringView let = {}; ///< empty for one that is only read
};

// clang-format off
inline constexpr Property DebugSwitch{u"P_GET DebugSwitch", u"P_LET DebugSwitch"};
inline constexpr Property JoinModifyDisabled{u"P_GET JoinModifyDisabled", u"P_LET JoinModifyDisabled"};
inline constexpr Property VisibleFrameLeft{u"P_GET VisibleFrameLeft", u"P_LET VisibleFrameLeft"};
inline constexpr Property VisibleFrameTop{u"P_GET VisibleFrameTop", u"P_LET VisibleFrameTop"};
inline constexpr Property Zandor{u"P_GET Zandor", u"P_SET Zandor"};
inline constexpr Property HorizMaxScrollPos{u"P_GET HorizMaxScrollPos", u"P_LET HorizMaxScrollPos"};
inline constexpr Property VertMaxScrollPos{u"P_GET VertMaxScrollPos", u"P_LET VertMaxScrollPos"};
inline constexpr Property HorizontalScrollbarPos{u"P_GET HorizontalScrollbarPos", u"P_LET HorizontalScrollbarPos"};
inline constexpr Property VerticalScrollbarPos{u"P_GET VerticalScrollbarPos", u"P_LET VerticalScrollbarPos"};
inline constexpr Property OnlyJoin{u"P_GET OnlyJoin", u"P_LET OnlyJoin"};
inline constexpr Property UseJoinTypeNormal{u"P_GET UseJoinTypeNormal", u"P_LET UseJoinTypeNormal"};
inline constexpr Property UseJoinTypeLeft{u"P_GET UseJoinTypeLeft", u"P_LET UseJoinTypeLeft"};
inline constexpr Property UseJoinTypeRight{u"P_GET UseJoinTypeRight", u"P_LET UseJoinTypeRight"};
inline constexpr Property UseJoinTypeBoth{u"P_GET UseJoinTypeBoth", u"P_LET UseJoinTypeBoth"};
inline constexpr Property UseJoinCompareOperatorEquals{u"P_GET UseJoinCompareOperatorEquals", u"P_LET UseJoinCompareOperatorEquals"};
inline constexpr Property UseJoinCompareOperatorNotEquals{u"P_GET UseJoinCompareOperatorNotEquals", u"P_LET UseJoinCompareOperatorNotEquals"};
inline constexpr Property UseJoinCompareOperatorLess{u"P_GET UseJoinCompareOperatorLess", u"P_LET UseJoinCompareOperatorLess"};
inline constexpr Property UseJoinCompareOperatorGreater{u"P_GET UseJoinCompareOperatorGreater", u"P_LET UseJoinCompareOperatorGreater"};
inline constexpr Property UseJoinCompareOperatorLessEquals{u"P_GET UseJoinCompareOperatorLessEquals", u"P_LET UseJoinCompareOperatorLessEquals"};
inline constexpr Property UseJoinCompareOperatorGreaterEquals{u"P_GET UseJoinCompareOperatorGreaterEquals", u"P_LET UseJoinCompareOperatorGreaterEquals"};
inline constexpr Property UseJoinCompareOperatorLE{u"P_GET UseJoinCompareOperatorLessEquals", u"P_LET UseJoinCompareOperatorLE"};
inline constexpr Property UseJoinCompareOperatorGE{u"P_GET UseJoinCompareOperatorGE", u"P_LET UseJoinCompareOperatorGreaterEquals"};
inline constexpr Property lastjoin{u"P_GET lastjoin"};
inline constexpr Property activetable{u"P_GET activetable"};
inline constexpr Property ActiveColumn{u"P_GET activecolumn"};
// clang-format on

} // namespace TalvikDBxZandor::report

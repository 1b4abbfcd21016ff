#pragma once

#include <QString>

// The properties of the widget that are a text, a flag or a number, as one table. A front end of Qt
// has to say each of them to moc, to the compiler and in code; all three are made from here, and
// moc expands the table as the compiler does. What a property is for stands in docs/interface.md.

// clang-format off
#define ZANDOR_WIDGET_PROPERTIES(FIELD_TEXT, FIELD_FLAG, FIELD_NUMBER, PROPERTY_FLAG, PROPERTY_NUMBER) \
    FIELD_TEXT(LNGJoinForm) \
    FIELD_TEXT(LNGJoinLeftTable) \
    FIELD_TEXT(LNGJoinLeftColumn) \
    FIELD_TEXT(LNGJoinRightTable) \
    FIELD_TEXT(LNGJoinRightColumn) \
    FIELD_TEXT(LNGJoinType) \
    FIELD_TEXT(LNGJoinTypeNormal) \
    FIELD_TEXT(LNGJoinTypeLeftOuter) \
    FIELD_TEXT(LNGJoinTypeRightOuter) \
    FIELD_TEXT(LNGJoinTypeBothOuter) \
    FIELD_TEXT(LNGJoinOk) \
    FIELD_TEXT(LNGJoinCancel) \
    FIELD_TEXT(LNGMnuShowJoinDef) \
    FIELD_TEXT(LNGMnuDelJoin) \
    FIELD_TEXT(LNGMnuCopyCol) \
    FIELD_TEXT(LNGMnuCreateJoin) \
    FIELD_TEXT(LNGMnuDelTable) \
    FIELD_TEXT(LNGMnuPasteCol) \
    FIELD_TEXT(LNGMnuDelCol) \
    FIELD_TEXT(LNGSpreadField) \
    FIELD_TEXT(LNGSpreadSynonym) \
    FIELD_TEXT(LNGSpreadSort) \
    FIELD_TEXT(LNGSpreadVisible) \
    FIELD_TEXT(LNGSpreadCriteria) \
    FIELD_TEXT(LNGSpreadOr) \
    FIELD_FLAG(LNGMnuShowJoinDefVis) \
    FIELD_FLAG(LNGMnuDelJoinVis) \
    FIELD_FLAG(LNGMnuCopyColVis) \
    FIELD_FLAG(LNGMnuCreateJoinVis) \
    FIELD_FLAG(LNGMnuDelTableVis) \
    FIELD_FLAG(LNGMnuPasteColVis) \
    FIELD_FLAG(LNGMnuDelColVis) \
    FIELD_FLAG(LNGMnuSep1Vis) \
    FIELD_FLAG(LNGMnuSep2Vis) \
    FIELD_NUMBER(MXHorzFrameSize) \
    FIELD_NUMBER(MXVertFrameSize) \
    FIELD_TEXT(DeletedTable) \
    PROPERTY_NUMBER(DebugSwitch) \
    PROPERTY_NUMBER(JoinModifyDisabled) \
    PROPERTY_NUMBER(VisibleFrameLeft) \
    PROPERTY_NUMBER(VisibleFrameTop) \
    PROPERTY_NUMBER(HorizMaxScrollPos) \
    PROPERTY_NUMBER(VertMaxScrollPos) \
    PROPERTY_NUMBER(HorizontalScrollbarPos) \
    PROPERTY_NUMBER(VerticalScrollbarPos) \
    PROPERTY_FLAG(OnlyJoin) \
    PROPERTY_FLAG(UseJoinTypeNormal) \
    PROPERTY_FLAG(UseJoinTypeLeft) \
    PROPERTY_FLAG(UseJoinTypeRight) \
    PROPERTY_FLAG(UseJoinTypeBoth) \
    PROPERTY_FLAG(UseJoinCompareOperatorEquals) \
    PROPERTY_FLAG(UseJoinCompareOperatorNotEquals) \
    PROPERTY_FLAG(UseJoinCompareOperatorLess) \
    PROPERTY_FLAG(UseJoinCompareOperatorGreater) \
    PROPERTY_FLAG(UseJoinCompareOperatorLessEquals) \
    PROPERTY_FLAG(UseJoinCompareOperatorGreaterEquals) \
    PROPERTY_FLAG(UseJoinCompareOperatorLE) \
    PROPERTY_FLAG(UseJoinCompareOperatorGE)
// clang-format on

#define ZANDOR_DECLARE_PROPERTY(type, argument, name)                                              \
    Q_PROPERTY(type name READ name WRITE set##name)                                                \
public:                                                                                            \
    type name() const;                                                                             \
    void set##name(argument value);

#define ZANDOR_DECLARE_TEXT(name) ZANDOR_DECLARE_PROPERTY(QString, const QString&, name)
#define ZANDOR_DECLARE_FLAG(name) ZANDOR_DECLARE_PROPERTY(bool, bool, name)
#define ZANDOR_DECLARE_NUMBER(name) ZANDOR_DECLARE_PROPERTY(int, int, name)

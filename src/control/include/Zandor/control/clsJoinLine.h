#pragma once

#include <Zandor/control/DrawnEnd.h>
#include <Zandor/control/PackedTexts.h>
#include <Zandor/control/basZandor.h>
#include <Zandor/platform/Variant.h>
#include <Zandor/platform/export.h>

#include <optional>
#include <utility>

namespace TalvikDBxZandor {

/// The canvas record of one join. A plain record: no setter checks its value; handles, codes and
/// indexes are stored as they come. Indexes of -1 mean that no drawing element is allotted yet.
class ZANDOR_CONTROL_EXPORT clsJoinLine {
public:
    static constexpr platform::StringView ModuleName = u"TalvikDBxZandor.clsJoinLine";
    using String = platform::String;

    explicit clsJoinLine(platform::MessageBoxes& boxes) : mBoxes(&boxes) {}

    // clang-format off
    std::int32_t LeftTablehwnd() const { return Get(u"P_GET LeftTablehwnd", &Fields::LeftTablehwnd); }
    void LeftTablehwnd(std::int32_t v) { Let(u"P_LET LeftTablehwnd", &Fields::LeftTablehwnd, v); LeftEnd = {}; }
    std::int32_t RightTablehwnd() const { return Get(u"P_GET RightTablehwnd", &Fields::RightTablehwnd); }
    void RightTablehwnd(std::int32_t v) { Let(u"P_LET RightTablehwnd", &Fields::RightTablehwnd, v); RightEnd = {}; }
    String LeftColumnText() const { return Get(u"P_GET LeftColumnText", leftColumnText); }
    void LeftColumnText(const String& v) { Let(u"P_LET LeftColumnText", leftColumnText, v); }
    String RightColumnText() const { return Get(u"P_GET RightColumnText", rightColumnText); }
    void RightColumnText(const String& v) { Let(u"P_LET RightColumnText", rightColumnText, v); }
    std::int32_t CompareOperator() const { return Get(u"P_GET CompareOperator", &Fields::CompareOperator); }
    void CompareOperator(std::int32_t v) { Let(u"P_LET CompareOperator", &Fields::CompareOperator, v); }
    std::int32_t JoinType() const { return Get(u"P_GET JoinType", &Fields::JoinType); }
    void JoinType(std::int32_t v) { Let(u"P_LET JoinType", &Fields::JoinType, v); Drawn = {}; }
    String LeftTableName() const { return Get(u"P_GET LeftTableName", leftTableName); }
    void LeftTableName(const String& v) { Let(u"P_LET LeftTableName", leftTableName, v); }
    String LeftColumnName() const { return Get(u"P_GET LeftColumnName", leftColumnName); }
    void LeftColumnName(const String& v) { Let(u"P_LET LeftColumnName", leftColumnName, v); LeftEnd = {}; }
    String RightTableName() const { return Get(u"P_GET RightTableName", rightTableName); }
    void RightTableName(const String& v) { Let(u"P_LET RightTableName", rightTableName, v); }
    String RightColumnName() const { return Get(u"P_GET RightColumnName", rightColumnName); }
    void RightColumnName(const String& v) { Let(u"P_LET RightColumnName", rightColumnName, v); RightEnd = {}; }
    std::int32_t JoinLineIndex() const { return Get(u"P_GET JoinLineIndex", &Fields::JoinLineIndex); }
    void JoinLineIndex(std::int32_t v) { Let(u"P_LET JoinLineIndex", &Fields::JoinLineIndex, v); Drawn = {}; }
    std::int32_t LeftConnectorIndex() const { return Get(u"P_GET LeftConnectorIndex", &Fields::LeftConnectorIndex); }
    void LeftConnectorIndex(std::int32_t v) { Let(u"P_LET LeftConnectorIndex", &Fields::LeftConnectorIndex, v); Drawn = {}; }
    std::int32_t RightConnectorIndex() const { return Get(u"P_GET RightConnectorIndex", &Fields::RightConnectorIndex); }
    void RightConnectorIndex(std::int32_t v) { Let(u"P_LET RightConnectorIndex", &Fields::RightConnectorIndex, v); Drawn = {}; }
    std::int16_t Index() const { return Get(u"P_GET Index", &Fields::Index); }
    void Index(std::int16_t v) { Let(u"P_LET Index", &Fields::Index, v); }
    platform::Variant Tag() const { return Get(u"P_GET Tag", &Fields::Tag); }
    void Tag(const platform::Variant& v) { Let(u"P_LET Tag", &Fields::Tag, v); }
    // clang-format on

    /// Takes over all fifteen fields of another record.
    void CopyFields(const clsJoinLine& other) {
        Fields copy = other.mFields; // all or none
        mFields = std::move(copy);
        LeftEnd = RightEnd = {};
        Drawn = {};
    }

    /// The names of the columns without a copy, for as long as they stay what they are.
    platform::StringView LeftColumn() const { return mFields.Texts[leftColumnName]; }
    platform::StringView RightColumn() const { return mFields.Texts[rightColumnName]; }
    bool IsLeftColumn(platform::StringView name) const { return LeftColumn() == name; }
    bool IsRightColumn(platform::StringView name) const { return RightColumn() == name; }
    /// Whether a side is in the table list of a handle; asked of all joins at each step of a move.
    bool IsOf(std::int32_t handle) const {
        return mFields.LeftTablehwnd == handle || mFields.RightTablehwnd == handle;
    }

    // What the control has drawn last. A field that it was found by makes it unknown again.
    DrawnEnd LeftEnd;  ///< by LeftTablehwnd and LeftColumnName
    DrawnEnd RightEnd; ///< by RightTablehwnd and RightColumnName
    /// Whether line and marks are as they are to be, but for their places, with the left end in the
    /// west.
    std::optional<bool> Drawn;

private:
    enum TextField : std::uint8_t {
        leftColumnName,
        leftColumnText,
        rightColumnText,
        rightColumnName,
        leftTableName,
        rightTableName,
        textCount
    };
    struct Fields {
        std::int32_t JoinType = 0;
        std::int32_t CompareOperator = 0;
        PackedTexts<textCount> Texts;
        std::int32_t LeftTablehwnd = 0;
        std::int32_t RightTablehwnd = 0;
        std::int32_t JoinLineIndex = -1;
        std::int32_t LeftConnectorIndex = -1;
        std::int32_t RightConnectorIndex = -1;
        std::int16_t Index = 0;
        platform::Variant Tag;
    };

    template <class T>
    T Get(platform::StringView procedure, T Fields::*field) const {
        T result{};
        basZandor::Guard(*mBoxes, ModuleName, procedure, [&] { result = mFields.*field; });
        return result;
    }

    template <class T>
    void Let(platform::StringView procedure, T Fields::*field, const T& value) {
        basZandor::Guard(*mBoxes, ModuleName, procedure, [&] { mFields.*field = value; });
    }

    String Get(platform::StringView procedure, TextField field) const {
        String result;
        basZandor::Guard(*mBoxes, ModuleName, procedure, [&] { result = mFields.Texts[field]; });
        return result;
    }

    void Let(platform::StringView procedure, TextField field, const String& value) {
        basZandor::Guard(*mBoxes, ModuleName, procedure, [&] { mFields.Texts.set(field, value); });
    }

    platform::MessageBoxes* mBoxes;
    Fields mFields;
};

} // namespace TalvikDBxZandor

#pragma once

#include "basZandor.h"
#include "clsJoinLine.h"
#include "platform/TalvikZandorLib.h"

namespace TalvikDBxZandor {

/// The modal dialog that shows one join and lets the user change its type and operator.
///
/// List positions are used as codes in both directions: with some types or operators not offered,
/// a code selects, and is read back as, the entry at that position.
class frmJoinDefinition {
public:
    static constexpr platform::StringView ModuleName = u"TalvikDBxZandor.frmJoinDefinition";

    /// `debug`: whether the names set through Join are shown in debug boxes first.
    frmJoinDefinition(platform::Toolkit& toolkit, bool debug);

    /// Shows a join. A code beyond the end of its list is reported, and what was filled before it
    /// stays.
    void Join(const platform::Ref<TalvikZandorLib::ZDJoin>& value);
    /// The canvas record, whose fields Cancel brings back.
    void JoinLine(const platform::Ref<clsJoinLine>& value);
    /// Whether Ok changed the join.
    bool JoinIsModified() const;
    /// Nonzero lets the user change type and operator, 0 forbids it: the reverse of the name.
    std::int16_t JoinModifyDisabled() const;
    void JoinModifyDisabled(std::int16_t value);

    // The control dresses and fills these before the dialog is shown.
    std::unique_ptr<platform::Dialog> form;
    std::unique_ptr<platform::Label> lblLeftTable;
    std::unique_ptr<platform::TextBox> txtLeftTable;
    std::unique_ptr<platform::Label> lblLeftColumn;
    std::unique_ptr<platform::TextBox> txtLeftColumn;
    std::unique_ptr<platform::Label> lblRightTable;
    std::unique_ptr<platform::TextBox> txtRightTable;
    std::unique_ptr<platform::Label> lblRightColumn;
    std::unique_ptr<platform::TextBox> txtRightColumn;
    std::unique_ptr<platform::Label> lblJoinType;
    std::unique_ptr<platform::ComboBox> cboJoinType;
    std::unique_ptr<platform::Label> lblJoinCompareOperator;
    std::unique_ptr<platform::ComboBox> cboJoinCompareOperator;
    std::unique_ptr<platform::CommandButton> cmdOk;
    std::unique_ptr<platform::CommandButton> cmdCancel;

private:
    template <class Body>
    void Guard(platform::StringView procedure, Body&& body) const;
    void Form_Initialize();
    clsJoinLine& SavedLine();
    void ShowName(platform::TextBox& box, platform::StringView label, const platform::String& name);
    void cmdOk_Click();
    void cmdCancel_Click();

    platform::Toolkit& mToolkit;
    const bool mDebug;
    platform::Ref<TalvikZandorLib::ZDJoin> mJoin;
    platform::Ref<clsJoinLine> mJoinLine;
    platform::Ref<clsJoinLine> mSavedLine;
    bool mJoinIsModified = false;
    std::int16_t mJoinModifyDisabled = 0;
};

} // namespace TalvikDBxZandor

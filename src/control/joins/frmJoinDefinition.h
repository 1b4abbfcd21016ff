#pragma once

#include <Zandor/TalvikZandorLib.h>
#include <Zandor/control/Reached.h>
#include <Zandor/control/basZandor.h>
#include <Zandor/control/clsJoinLine.h>

namespace TalvikDBxZandor {

/// The modal dialog that shows one join and lets the user change its type and operator.
///
/// List positions are used as codes in both directions: with some types or operators not offered,
/// a code selects, and is read back as, the entry at that position.
class frmJoinDefinition {
public:
    static constexpr platform::StringView ModuleName = u"TalvikDBxZandor.frmJoinDefinition";

    /// `debug`: whether the names set through Join are shown in debug boxes first. The life is that
    /// of the control that opens the dialog: once it has ended, the dialog does nothing more.
    frmJoinDefinition(Life& life, platform::Toolkit& toolkit, bool debug);

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
    Part<platform::Dialog> form;
    Part<platform::Label> lblLeftTable;
    Part<platform::TextBox> txtLeftTable;
    Part<platform::Label> lblLeftColumn;
    Part<platform::TextBox> txtLeftColumn;
    Part<platform::Label> lblRightTable;
    Part<platform::TextBox> txtRightTable;
    Part<platform::Label> lblRightColumn;
    Part<platform::TextBox> txtRightColumn;
    Part<platform::Label> lblJoinType;
    Part<platform::ComboBox> cboJoinType;
    Part<platform::Label> lblJoinCompareOperator;
    Part<platform::ComboBox> cboJoinCompareOperator;
    Part<platform::CommandButton> cmdOk;
    Part<platform::CommandButton> cmdCancel;

private:
    template <class Body>
    void Guard(platform::StringView procedure, Body&& body) const;
    void Form_Initialize();
    void ShowName(const Part<platform::TextBox>& box, platform::StringView label,
                  const platform::String& name);
    void cmdOk_Click();
    void cmdCancel_Click();

    Life& mLife;
    const bool mDebug;
    Held<TalvikZandorLib::ZDJoin> mJoin;
    platform::Ref<clsJoinLine> mJoinLine;
    platform::Ref<clsJoinLine> mSavedLine; ///< as it was when the dialog opened
    bool mJoinIsModified = false;
    std::int16_t mJoinModifyDisabled = 0;
};

} // namespace TalvikDBxZandor

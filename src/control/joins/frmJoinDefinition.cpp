#include "control/joins/frmJoinDefinition.h"

namespace TalvikDBxZandor {

using platform::StringView;

namespace {

std::unique_ptr<platform::Label> label(platform::Toolkit& toolkit, platform::Control* form,
                                       StringView name, StringView caption) {
    return toolkit.makeLabel({.Name = name, .Caption = caption, .Container = form});
}

std::unique_ptr<platform::TextBox> textBox(platform::Toolkit& toolkit, platform::Control* form,
                                           StringView name) {
    return toolkit.makeTextBox({.Name = name, .Container = form}, {});
}

} // namespace

frmJoinDefinition::frmJoinDefinition(Life& life, platform::Toolkit& toolkit, bool debug)
    : form(life, toolkit.makeDialog({.Name = u"frmJoinDefinition", .Caption = u"Join Definition"},
                                    {.Close = [this] { cmdCancel_Click(); }})),
      lblLeftTable(life, label(toolkit, form.get(), u"lblLeftTable", u"Left Table:")),
      txtLeftTable(life, textBox(toolkit, form.get(), u"txtLeftTable")),
      lblLeftColumn(life, label(toolkit, form.get(), u"lblLeftColumn", u"Left Column:")),
      txtLeftColumn(life, textBox(toolkit, form.get(), u"txtLeftColumn")),
      lblRightTable(life, label(toolkit, form.get(), u"lblRightTable", u"Right Table:")),
      txtRightTable(life, textBox(toolkit, form.get(), u"txtRightTable")),
      lblRightColumn(life, label(toolkit, form.get(), u"lblRightColumn", u"Right Column:")),
      txtRightColumn(life, textBox(toolkit, form.get(), u"txtRightColumn")),
      lblJoinType(life, label(toolkit, form.get(), u"lblJoinType", u"Join Type")),
      cboJoinType(life, toolkit.makeComboBox(
                            {.Name = u"cboJoinType", .Container = form.get()},
                            {u"Normal", u"Left Outer", u"Right Outer", u"Both Outer"}, {})),
      lblJoinCompareOperator(
          life, label(toolkit, form.get(), u"lblJoinCompareOperator", u"Join Compare Operator")),
      cboJoinCompareOperator(
          life, toolkit.makeComboBox({.Name = u"cboJoinCompareOperator", .Container = form.get()},
                                     {}, {})),
      cmdOk(life, toolkit.makeCommandButton(
                      {.Name = u"cmdOk", .Caption = u"&Ok", .Container = form.get()},
                      {.Click = [this] { cmdOk_Click(); }, .GotFocus = {}})),
      cmdCancel(life, toolkit.makeCommandButton(
                          {.Name = u"cmdCancel", .Caption = u"&Cancel", .Container = form.get()},
                          {.Click = [this] { cmdCancel_Click(); }, .GotFocus = {}})),
      mLife(life), mDebug(debug) {
    Form_Initialize();
}

template <class Body>
void frmJoinDefinition::Guard(StringView procedure, Body&& body) const {
    if (mLife.ended()) return;
    basZandor::Guard(mLife, ModuleName, procedure, std::forward<Body>(body));
}

void frmJoinDefinition::Form_Initialize() {
    Guard(u"Form_Initialize", [&] { cmdOk->Default(true); });
}

void frmJoinDefinition::ShowName(const Part<platform::TextBox>& box, StringView labelText,
                                 const platform::String& name) {
    if (mDebug)
        basZandor::DebugMessage(mLife, platform::String(labelText) + name, ModuleName,
                                u"P_SET Join");
    box->Text(name);
}

void frmJoinDefinition::Join(const platform::Ref<TalvikZandorLib::ZDJoin>& value) {
    Guard(u"P_SET Join", [&] {
        mJoin = hold(mLife, value);
        ShowName(txtLeftTable, u"Left Table Name: ", hold(mLife, mJoin->LeftTable())->Name());
        ShowName(txtLeftColumn, u"Left Column Name: ", hold(mLife, mJoin->LeftColumn())->Name());
        ShowName(txtRightTable, u"Right Table Name: ", hold(mLife, mJoin->RightTable())->Name());
        ShowName(txtRightColumn, u"Right Column Name: ", hold(mLife, mJoin->RightColumn())->Name());
        const std::int16_t joinType = mJoin->JoinType();
        cboJoinType->ListIndex(joinType);
        const std::int16_t compareOperator = mJoin->CompareOperator();
        cboJoinCompareOperator->ListIndex(compareOperator);
    });
}

void frmJoinDefinition::JoinLine(const platform::Ref<clsJoinLine>& value) {
    Guard(u"P_SET JoinLine", [&] {
        mJoinLine = value;
        const auto saved = platform::makeRef<clsJoinLine>(mLife);
        saved->CopyFields(*mJoinLine);
        mSavedLine = saved;
    });
}

bool frmJoinDefinition::JoinIsModified() const {
    bool result = false;
    Guard(u"P_GET JoinIsModified", [&] { result = mJoinIsModified; });
    return result;
}

std::int16_t frmJoinDefinition::JoinModifyDisabled() const {
    std::int16_t result = 0;
    Guard(u"P_GET JoinModifyDisabled", [&] { result = mJoinModifyDisabled; });
    return result;
}

void frmJoinDefinition::JoinModifyDisabled(std::int16_t value) {
    Guard(u"P_LET JoinModifyDisabled", [&] {
        mJoinModifyDisabled = value;
        cboJoinType->Enabled(value != 0);
        cboJoinCompareOperator->Enabled(value != 0);
    });
}

void frmJoinDefinition::cmdOk_Click() {
    // Reports under the other button's name, as it always has.
    Guard(u"cmdCancel_Click", [&] {
        const std::int16_t compareOperator = cboJoinCompareOperator->ListIndex();
        const std::int16_t joinType = cboJoinType->ListIndex();
        mJoinIsModified =
            compareOperator != mJoin->CompareOperator() || joinType != mJoin->JoinType();
        if (mJoinIsModified) {
            mJoin->CompareOperator(compareOperator);
            mJoin->JoinType(joinType);
        }
        form->Hide();
    });
}

void frmJoinDefinition::cmdCancel_Click() {
    Guard(u"cmdCancel_Click", [&] {
        // Where nothing could be saved, nothing was changed either.
        if (mSavedLine || !mJoinLine) mJoinLine->CopyFields(*mSavedLine);
        form->Hide();
    });
}

} // namespace TalvikDBxZandor

#include "Plays.h"

#include "../control/Scenario.h"
#include "support/Backstage.h"

#include <algorithm>
#include <cctype>

using namespace zandor;

namespace {

using Backstage = TalvikDBxZandor::ZandorBackstage;
using platform::String;

using gridstage::enter;
using gridstage::escape;
using gridstage::left;
using gridstage::right;

const std::string orders = "lstTable(1)";
const std::string customers = "lstTable(2)";
const std::string parts = "lstTable(3)";
const std::string grid = "sprColumn";

/// What is done to a control, as steps: a gesture of its user or a call of its host.
struct Script {
    const char* name;
    void (*play)(HostedControl&);
};

/// A click of the right button on an entry, and a command of the menu.
void menuOn(HostedControl& c, const std::string& table, std::int32_t entry,
            const std::string& command) {
    c.step([&] { c.user.pressEntry(table, entry, right); });
    c.step([&] {
        c.chosen = command;
        c.user.releaseEntry(table, entry, right);
    });
}

void menuOnCell(HostedControl& c, std::int32_t row, std::int32_t col, const std::string& command) {
    c.step([&] { c.user.pressCell(grid, right, row, col); });
    c.step([&] {
        c.chosen = command;
        c.user.releaseCell(grid, right, row, col);
    });
}

/// On the middle of the first join's line.
void menuOnJoin(HostedControl& c, const std::string& command, const std::string& button = {}) {
    c.step([&] {
        const auto& line = c.toolkit.find<platform::headless::Line>("linJoin(1)").ends();
        const float x = (line.X1 + line.X2) / 2;
        const float y = (line.Y1 + line.Y2) / 2;
        c.user.pressFrame("fraTable", right, x, y);
        if (c.gone()) return;
        c.chosen = command;
        c.inDialog = [&c, button] {
            if (button.empty()) return;
            c.user.choose("cboJoinType", 1);
            c.user.choose("cboJoinCompareOperator", 3);
            c.user.clickButton(button);
        };
        c.user.releaseFrame("fraTable", right, x, y);
    });
}

const Script scripts[] = {
    {"a binding", [](HostedControl& c) { c.step([&] { c.bind(c.model); }); }},
    {"methods of the host",
     [](HostedControl& c) {
         c.step([&] { c.control().SetCurrentTable(u"CUSTOMERS"); });
         c.step([&] { c.control().SelectColumnNames(u"ORDERS", u"TOTAL"); });
         c.step([&] { c.control().OnlyJoin(true); });
         c.step([&] { c.control().OnlyJoin(false); });
         c.step([&] { c.control().VisibleFrameLeft(600); });
         c.step([&] { c.control().UserControl_Paint(); });
         c.step([&] { c.control().UserControl_Resize(); });
         c.step([&] { c.control().P_GET_Zandor(); });
         c.step([&] { Backstage::ShowSelectedTable(c.control()); });
     }},
    {"the model shown anew",
     [](HostedControl& c) {
         const auto show = [&] { c.step([&] { c.control().ShowAnew(); }); };
         show();
         c.step([&] { c.user.selectEntries(orders, {2, 4}); });
         c.step([&] { c.user.pressCell(grid, left, 4, 2); });
         c.step([&] { c.user.type("txtValue", u"> 5"); });
         c.changesTheModel = true;
         auto& model = *c.model;
         // Other names, places, columns and joins of what stays, and something new of each kind.
         c.step([&] {
             model.tableAt(1).name = u"SALES";
             model.tableAt(1).place(600, 450, 2400, 2400);
             model.tableAt(1).addColumn(u"STATE");
             const auto items = model.table(u"ITEMS", {u"*", u"ID"});
             model.join(items, u"ID",
                        std::dynamic_pointer_cast<fake::Table>(model.tables.items.Item(1)), u"ID");
             model.definition(items, u"ID");
             model.definitionAt(1).synonym = u"Number";
             model.joinAt(1).joinType = 1;
         });
         show();
         // What has gone: the table with the focus, a join, the definition being edited.
         c.step([&] { c.user.focus(customers); });
         c.step([&] {
             model.tables.items.Remove(model.tableAt(2).key);
             model.definitions.items.Remove(model.definitionAt(2).key);
             model.joins.items.Remove(model.joinAt(1).key);
         });
         show();
     }},
    {"the host's Terminate", [](HostedControl& c) { c.step([&] { c.control().Terminate(); }); }},
    {"the end", [](HostedControl& c) { c.step([&] { c.destroy(); }); }},
    {"entries pressed",
     [](HostedControl& c) {
         c.step([&] { c.user.focus(parts); });
         c.step([&] { c.user.selectEntries(customers, {2, 3}); });
         c.step([&] { c.user.pressEntry(customers, 2, left); });
         c.step([&] { c.user.releaseEntry(customers, 2, left); });
         menuOn(c, orders, 2, "");
     }},
    {"a drag to a table",
     [](HostedControl& c) {
         c.step([&] { c.user.dragToEntry(orders, 2, customers, 3); });
         c.step([&] { c.user.dragToEntry(customers, 3, parts, 2); });
     }},
    {"a drag to the grid",
     [](HostedControl& c) {
         c.step([&] { c.user.selectEntries(orders, {2, 4}); });
         c.step([&] { c.user.dragToCell(orders, 2, grid, 1, 2); });
     }},
    {"a column copied, joined and pasted",
     [](HostedControl& c) {
         menuOn(c, orders, 4, "mnuTableDefinitionCopy");
         menuOn(c, parts, 2, "mnuTableDefinitionPaste");
         menuOnCell(c, 1, 2, "mnuColumnDefinitionPaste");
     }},
    {"a column deleted",
     [](HostedControl& c) { menuOnCell(c, 1, 1, "mnuColumnDefinitionDelete"); }},
    {"tables closed",
     [](HostedControl& c) {
         menuOn(c, customers, 2, "mnuTableDefinitionDelete");
         c.step([&] { c.user.closeTable(orders); });
     }},
    {"a join defined and deleted",
     [](HostedControl& c) {
         c.control().JoinModifyDisabled(1);
         menuOnJoin(c, "mnuJoinShowDefinition", "cmdCancel");
         menuOnJoin(c, "mnuJoinShowDefinition", "cmdOk");
         menuOnJoin(c, "mnuJoinDelete");
     }},
    {"cells edited",
     [](HostedControl& c) {
         c.step([&] { c.user.pressCell(grid, left, 1, 1); });
         c.step([&] { c.user.type("txtValue", u"Number"); });
         c.step([&] { c.user.clickButton("cmdSetTextValue"); });
         c.step([&] { c.user.pressCell(grid, left, 2, 1); });
         c.step([&] { c.user.choose("cobSortOrder", 2); });
         c.step([&] { c.user.key("cobSortOrder", enter); });
         c.step([&] { c.user.pressCell(grid, left, 3, 2); });
         c.step([&] { c.user.choose("cobVisibility", 1); });
         c.step([&] { c.user.clickButton("cmdSetVisibility"); });
         for (const char16_t* const text : {u"> 2", u"", u"= 3"}) {
             c.step([&] { c.user.pressCell(grid, left, 4, 1); });
             c.step([&] { c.user.type("txtValue", text); });
             c.step([&] { c.user.key("txtValue", enter); });
         }
         c.step([&] { c.user.pressCell(grid, left, 5, 1); });
         c.step([&] { c.user.key("txtValue", escape); });
     }},
    {"a host that is asked",
     [](HostedControl& c) {
         c.step([&] { c.ask(); });
         menuOn(c, orders, 4, "mnuTableDefinitionCopy");
         menuOn(c, parts, 2, "mnuTableDefinitionPaste");
         c.step([&] { c.user.dragToEntry(orders, 2, customers, 3); });
         c.step([&] { c.user.dragToCell(orders, 2, grid, 1, 2); });
         menuOnCell(c, 1, 1, "mnuColumnDefinitionDelete");
         menuOnCell(c, 1, 1, "mnuHost1");
         menuOnJoin(c, "mnuJoinDelete");
         c.step([&] { c.user.closeTable(orders); });
     }},
    {"a drawing that is only read",
     [](HostedControl& c) {
         c.step([&] { c.user.pressCell(grid, left, 4, 1); });
         c.step([&] { c.control().ReadOnly(true); });
         menuOn(c, orders, 4, "mnuTableDefinitionCopy");
         menuOnJoin(c, "mnuJoinShowDefinition", "cmdOk");
         c.step([&] { c.control().ReadOnly(false); });
     }},
    {"tables moved, sized and scrolled",
     [](HostedControl& c) {
         c.step([&] { c.user.moveTable(customers, 4500, 900); });
         c.step([&] { c.user.resizeTable(orders, 2100, 1200); });
         c.step([&] { c.user.scrollList(orders, 3); });
         c.step([&] { c.user.scrollBarTo("hsbTable", 450); });
         c.step([&] { c.user.scrollBarTo("vsbTable", 450); });
         c.step([&] { c.user.clickButton("cmdHome"); });
         c.step([&] { c.user.scrollGrid(grid, 2, 2); });
         c.step([&] { c.user.resizeControl(9000, 7500); });
         c.step([&] { c.user.repaint(); });
     }},
    {"reports of a model that fails",
     [](HostedControl& c) {
         const auto refuse = [&](const char* call) {
             c.model->fail(call, platform::RuntimeError{1234, u"The host refuses."});
         };
         refuse("Zandor.AddJoin");
         c.step([&] { c.user.dragToEntry(orders, 2, parts, 3); });
         refuse("ZDTable.Left=");
         c.step([&] { c.user.moveTable(customers, 4500, 900); });
         refuse("ZDTable.Selected=");
         c.step([&] { c.user.focus(parts); });
         refuse("Zandor.AddColumnDefinition");
         c.step([&] { c.user.dragToCell(orders, 2, grid, 1, 2); });
         refuse("ZDColumn.Key");
         c.step([&] { c.bind(c.model); });
     }},
    {"reports of a toolkit that fails",
     [](HostedControl& c) {
         const auto refuse = [&](const char* call, int nth = 1) {
             c.toolkit.faults.failNext(call, platform::RuntimeError{31, u"Cannot draw"}, nth);
         };
         refuse("linJoin(1).setEnds");
         c.step([&] { c.user.moveTable(orders, 900, 900); });
         refuse("shpJoin(3).setBounds", 2);
         c.step([&] { c.user.dragToEntry(orders, 2, parts, 3); });
         refuse("cmdHome.setBounds");
         c.step([&] { c.control().UserControl_Resize(); });
         refuse("lstTable(2).Terminate");
         c.step([&] { c.user.closeTable(customers); });
     }},
};

/// A scenario of the suite, with the host in its way.
class HostedScenario final : public gridstage::Scenario {
public:
    explicit HostedScenario(HostedControl& hosted)
        : Scenario(*hosted.stage, hosted.model), mHosted(hosted) {}
    void step(const std::function<void()>& deed) override { mHosted.step(deed); }
    void look(const std::function<void()>&) override {}
    void closeControl() override {
        mHosted.step([this] { mHosted.destroy(); });
    }

private:
    HostedControl& mHosted;
};

} // namespace

std::vector<Play> plays() {
    std::vector<Play> all;
    for (const Script& script : scripts)
        all.push_back({script.name, HostedControl::fill, script.play});
    for (const auto& scenario : gridstage::scenarios())
        all.push_back({std::string("the scenario ") + scenario.name, gridstage::addTables,
                       [&scenario](HostedControl& hosted) {
                           hosted.control().JoinModifyDisabled(1);
                           HostedScenario user(hosted);
                           scenario.play(user);
                       }});
    return all;
}

std::string nameOf(const testing::TestParamInfo<Play>& info) {
    std::string name = info.param.name;
    std::ranges::replace_if(
        name, [](unsigned char c) { return !std::isalnum(c); }, '_');
    return name;
}

#include "Scenario.h"

namespace gridstage {

namespace {

void columnsDragged(Scenario& user) {
    user.dragTo(ORDERS, {customer}, CUSTOMERS, id);
    user.dragTo(ORDERS, {id}, ORDERS, total);
    user.dragTo(ORDERS, {id}, CUSTOMERS, allColumns);
    user.dragTo(ORDERS, {allColumns}, CUSTOMERS, name);
    user.dragTo(ORDERS, {id, total}, CUSTOMERS, name);
    user.dragTo(CUSTOMERS, {id}, PARTS, nowhere);
    user.dragToColumn(ORDERS, {id, customer, total}, 1);
    user.dragToColumn(CUSTOMERS, {name}, 2);
    user.dragToColumn(PARTS, {no}, 0);
    user.dragToColumn(ORDERS, {allColumns}, 7);
    user.noteQuery(6);
}

// The mouse alone; no key is pressed.
void tablesMoved(Scenario& user) {
    user.dragTo(ORDERS, {customer}, CUSTOMERS, id);
    user.dragTo(CUSTOMERS, {name}, PARTS, no);
    user.dragToColumn(CUSTOMERS, {id, name}, 1);
    const auto move = [&user](std::int16_t table, float x, float y) {
        user.moveTable(table, x, y);
        user.notePlace(table);
    };
    move(ORDERS, 900, 600);
    move(ORDERS, -450, -600);
    move(PARTS, 11700, 4350);
    move(PARTS, 9000, 3000);
    user.resizeTable(ORDERS, 3000, 2700);
    user.notePlace(ORDERS);
    user.note("> scroll");
    user.scrollBarTo("hsbTable", 300);
    user.scrollBarTo("vsbTable", 600);
    user.scrollList(ORDERS, 1);
    move(ORDERS, 150, 300);
    move(PARTS, 12000, 6000);
    user.note("> home");
    user.clickButton("cmdHome");
    user.noteScroll();
    user.closeTable(CUSTOMERS);
    user.noteQuery(1);
    user.closeTable(ORDERS);
    user.noteScroll();
    user.closeTable(PARTS);
    user.noteScroll();
}

void traces(Scenario& user) {
    user.note("> focus table 3");
    user.focus("lstTable(3)");
    user.selectEntries(ORDERS, {id, total});
    user.selectEntries(CUSTOMERS, {name});
    user.step([&] { user.control().DebugSwitch(1); });
    user.note("> press ORDERS.ID");
    user.pressEntry(ORDERS, id, left);
    user.note("> release it");
    user.releaseEntry(ORDERS, id, left);
    user.note("> menu on CUSTOMERS.NAME");
    user.pressEntry(CUSTOMERS, name, right);
    user.releaseEntry(CUSTOMERS, name, right);
    user.selectEntries(ORDERS, {customer});
    user.dragTo(ORDERS, {customer}, CUSTOMERS, id);
    user.moveTable(PARTS, 9000, 900);
    user.resizeTable(PARTS, 2400, 2100);
    user.menuOnJoin(1, "mnuJoinShowDefinition");
    user.closeTable(CUSTOMERS);
    user.note("> close the control");
    user.closeControl();
}

void cellsSet(Scenario& user) {
    user.dragToColumn(ORDERS, {id, total}, 1);
    user.openCell(synonymRow, 1);
    user.type("txtValue", u"Number");
    user.clickButton("cmdSetTextValue");
    user.openCell(synonymRow, 2);
    user.type("txtValue", u"Sum");
    user.key("txtValue", enter);
    user.noteEditor();
    user.openCell(sortRow, 1);
    user.choose("cobSortOrder", 2);
    user.key("cobSortOrder", enter);
    user.openCell(sortRow, 1);
    user.choose("cobSortOrder", 1);
    user.key("cobSortOrder", escape);
    user.noteEditor();
    user.openCell(visibleRow, 2);
    user.choose("cobVisibility", 1);
    user.clickButton("cmdSetVisibility");
    user.openCell(visibleRow, 1);
    user.choose("cobVisibility", 1);
    user.key("cobVisibility", escape);
    user.openCell(criteriaRow, 1);
    user.type("txtValue", u"> 7");
    user.clickButton("cmdSetTextValue");
    user.openCell(criteriaRow + 1, 1);
    user.type("txtValue", u"never");
    user.openCell(criteriaRow, 1);
    user.type("txtValue", u"never either");
    user.note("> press the canvas");
    user.pressCanvas(4350, 3900);
    user.noteEditor();
    user.openCell(criteriaRow, 1);
    user.note("> press the field row");
    user.pressCell(fieldRow, 1);
    user.noteEditor();
    user.openCell(criteriaRow, 2);
    user.type("txtValue", u"");
    user.clickButton("cmdSetTextValue");
    user.openCell(criteriaRow, 1);
    user.type("txtValue", u"");
    user.clickButton("cmdSetTextValue");
    user.openCell(synonymRow, 5);
    user.type("txtValue", u"lost");
    user.clickButton("cmdSetTextValue");
    user.note("> again");
    user.clickButton("cmdSetTextValue");
    user.noteEditor();
    user.note("> scroll the grid");
    user.scrollGrid(1, 2);
    user.noteEditor();
    user.noteQuery(2);
}

void menus(Scenario& user) {
    user.menuOnEntry(ORDERS, total);
    user.menuOnCell(synonymRow, 1);
    user.menuOnEntry(ORDERS, customer, "mnuTableDefinitionCopy");
    user.menuOnEntry(ORDERS, total, "mnuTableDefinitionPaste");
    user.menuOnEntry(CUSTOMERS, id, "mnuTableDefinitionPaste");
    user.note("> menu on the canvas");
    user.menuOnCanvas(4350, 3900);
    user.menuOnCell(synonymRow, 1, "mnuColumnDefinitionPaste");
    user.menuOnCell(sortRow, 1, "mnuColumnDefinitionPaste");
    user.menuOnEntry(PARTS, no, "mnuTableDefinitionCopy");
    user.menuOnCell(synonymRow, 0, "mnuColumnDefinitionPaste");
    user.menuOnCell(synonymRow, 2, "mnuColumnDefinitionDelete");
    user.menuOnCell(synonymRow, 7, "mnuColumnDefinitionDelete");
    user.menuOnJoin(1, "mnuJoinDelete");
    user.menuOnEntry(PARTS, no, "mnuTableDefinitionDelete");
    user.noteQuery(3);
}

void joinDefined(Scenario& user) {
    user.dragTo(ORDERS, {customer}, CUSTOMERS, id);
    const auto choose = [&user](std::int16_t type, std::int16_t compare, const char* button) {
        return [&user, type, compare, button] {
            user.choose("cboJoinType", type);
            user.choose("cboJoinCompareOperator", compare);
            if (*button) user.clickButton(button);
        };
    };
    const std::string show = "mnuJoinShowDefinition";
    user.menuOnJoin(1, show, [&user] { user.clickButton("cmdOk"); });
    user.menuOnJoin(1, show, [&user] { user.clickButton("cmdCancel"); });
    user.menuOnJoin(1, show, choose(1, 5, "cmdCancel"));
    user.menuOnJoin(1, show, choose(2, 3, ""));
    user.menuOnJoin(1, show, [&user] { user.key("cboJoinType", escape); });
    user.menuOnJoin(1, show, choose(1, 0, "cmdOk"));
    user.noteQuery(1);
    user.step([&] { user.control().JoinModifyDisabled(0); });
    user.menuOnJoin(1, show, choose(3, 4, "cmdOk"));
    user.noteQuery(1);
}

} // namespace

const std::vector<NamedScenario>& scenarios() {
    static const std::vector<NamedScenario> all{
        {"OfColumnsDraggedToTablesAndToTheGrid", columnsDragged},
        {"OfTablesMovedSizedScrolledAndClosed", tablesMoved},
        {"ToldByTheTraces", traces},
        {"OfCellsSetLeftAndSetTwice", cellsSet},
        {"OfTheMenuInItsThreePlaces", menus},
        {"OfAJoinsDefinitionShownKeptLeftAndChanged", joinDefined},
    };
    return all;
}

} // namespace gridstage

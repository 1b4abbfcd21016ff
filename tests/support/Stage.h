#pragma once

#include <Zandor/Zandor.h>
#include <Zandor/comforts/Comforts.h>

#include <functional>
#include <memory>
#include <ostream>
#include <vector>

/// One control on one toolkit, with a user in front of it. Each toolkit has a stage of its own, so
/// that the same tests run on every toolkit. Everything is in twips.
class Stage {
public:
    using String = zandor::platform::String;

    struct Box {
        String text;
        String title;
        std::int32_t style = 0;
        friend bool operator==(const Box&, const Box&) = default;
    };

    struct Raised {
        TalvikDBxZandor::Event event;
        TalvikDBxZandor::EventArguments arguments;
    };

    struct WindowMessage {
        String name;
        std::uintptr_t wParam = 0;
        bool menuOpen = false;
    };

    /// What a user sees of a constituent control; members that its kind lacks keep their zeros.
    struct Seen {
        zandor::platform::Bounds bounds;
        bool visible = false;
        bool enabled = false;
        bool focused = false;
        String text; ///< caption of a button or entry, title of a table, text of an input
        String font;
        std::int16_t listIndex = -1;
        bool dropped = false;                             ///< combo boxes: the list is down
        std::int16_t value = 0, max = 0, largeChange = 0; ///< scroll bars
        float X1 = 0, Y1 = 0, X2 = 0, Y2 = 0;             ///< lines
        std::int16_t borderWidth = 0;                     ///< lines
        std::int16_t shape = 0;                           ///< marks
        std::vector<String> items;                        ///< combo boxes, table lists, "lstFields"
        std::vector<String> selected; ///< table lists: texts of selected entries
        std::vector<String> output;   ///< table lists: texts of entries marked as coming out
        std::vector<String> keys;     ///< table lists: texts of entries that show a key
    };

    /// A menu entry at the moment the menu stands open.
    struct Entry {
        String name;
        String caption;
        bool enabled = false;
        bool visible = false;
    };

    virtual ~Stage() = default;

    /// Opens a control of 12000 by 9000 twips on the toolkit that this program is linked with. The
    /// library is the test's own; DebugSwitch is at its default of 1.
    static std::unique_ptr<Stage> open(TalvikZandorLib::Library& library);

    virtual TalvikDBxZandor::Zandor& control() = 0;
    virtual zandor::platform::Toolkit& toolkit() = 0;
    /// All off at first.
    virtual zandor::comforts::Comforts& comforts() = 0;
    /// Destroys the control (its closing boxes are recorded).
    virtual void closeControl() = 0;

    /// Everything shown or told so far, in order. Tests may clear them.
    std::vector<Box> boxes;
    std::vector<Raised> raised;
    std::vector<WindowMessage> messages;
    /// The order of everything: "box:Text", "event:JoinCreated", "message:0", "menu", "dialog".
    std::vector<std::string> transcript;

    /// Called while a popup menu stands open, with its entries; returns the name of the entry that
    /// the user chooses, or an empty text to dismiss the menu. Unset: dismissed.
    std::function<String(const std::vector<Entry>&)> onMenu;
    /// Called while the join dialog stands open. Unset: it is cancelled.
    std::function<void()> onDialog;
    /// Called while the host is told of an event.
    std::function<void()> onEvent;
    /// Called in each whole drag, of whatever it is, before the button comes up.
    std::function<void()> onHeld;

    /// By name: "hsbTable", "lstTable(3)", "linJoin(1)", "shpJoin(2)", "mnuJoinDelete"; while the
    /// dialog is open also its controls. Fails the test when there is no such control.
    virtual Seen look(const std::string& name) = 0;
    virtual bool exists(const std::string& name) = 0;
    /// Text of a grid cell as shown.
    virtual String cell(std::int32_t row, std::int32_t col) = 0;
    /// What is said about a grid cell, in its tooltip.
    virtual String note(std::int32_t row, std::int32_t col) = 0;

    // The user's hands.
    virtual void resizeControl(float width, float height) = 0;
    virtual void repaint() = 0;
    virtual void clickButton(const std::string& name) = 0;
    virtual void focus(const std::string& name) = 0;
    virtual void scrollBarTo(const std::string& name, std::int16_t value) = 0;
    /// Presses, drags and releases the title bar so that the table ends at a place.
    virtual void moveTable(std::int16_t index, float left, float top) = 0;
    virtual void resizeTable(std::int16_t index, float width, float height) = 0;
    virtual void closeTable(std::int16_t index) = 0;
    /// Scrolls a table's list so that an entry (1-based) is its first visible row.
    virtual void scrollList(std::int16_t index, std::int32_t firstEntry) = 0;
    virtual void scrollGrid(std::int32_t topRow, std::int32_t leftCol) = 0;
    /// Selects entries (1-based) as clicks with Ctrl do, without the button events.
    virtual void selectEntries(std::int16_t index, const std::vector<std::int32_t>& entries) = 0;
    /// 0: an empty place of the list.
    virtual void pressEntry(std::int16_t index, std::int32_t entry, std::int16_t button) = 0;
    virtual void releaseEntry(std::int16_t index, std::int32_t entry, std::int16_t button) = 0;
    /// Button is the sum of the buttons held.
    virtual void moveOverEntry(std::int16_t index, std::int32_t entry, std::int16_t button) = 0;
    /// Press, release and press again within the time of a double click.
    virtual void doubleClickEntry(std::int16_t index, std::int32_t entry) = 0;
    /// A whole drag of the selected entries from an entry to an entry of another or the same table
    /// (0: an empty place of the list).
    virtual void dragToEntry(std::int16_t from, std::int32_t entry, std::int16_t to,
                             std::int32_t target) = 0;
    /// A whole drag over an entry of another table on to the middle of a grid cell.
    virtual void dragAcross(std::int16_t from, std::int32_t entry, std::int16_t across,
                            std::int32_t passed, std::int32_t row, std::int32_t col) = 0;
    /// A whole drag to the middle of a grid cell.
    virtual void dragToCell(std::int16_t from, std::int32_t entry, std::int32_t row,
                            std::int32_t col) = 0;
    virtual void pressCanvas(std::int16_t button, float x, float y) = 0;
    virtual void releaseCanvas(std::int16_t button, float x, float y) = 0;
    virtual void pressCell(std::int16_t button, std::int32_t row, std::int32_t col) = 0;
    virtual void releaseCell(std::int16_t button, std::int32_t row, std::int32_t col) = 0;
    virtual void type(const std::string& name, const String& text) = 0;
    virtual void choose(const std::string& name, std::int16_t listIndex) = 0;
    /// Chooses an item from a list by the mouse, where `choose` walks to it by keys.
    virtual void pick(const std::string& name, std::int16_t listIndex) = 0;
    virtual void key(const std::string& name, std::int16_t keyCode, std::int16_t shift = 0) = 0;
    /// Types into the grid, with no editor open.
    virtual void typeInGrid(const String& text) = 0;
    /// Types into the open list of fields and takes the first that is left by Enter.
    virtual void pickField(const String& text) = 0;
    /// A click on the field of a grid column.
    virtual void clickField(std::int32_t col) = 0;
    /// Drags a grid column by its field to the place of another column.
    virtual void dragField(std::int32_t col, std::int32_t to) = 0;
    /// Drags the right border of a grid column until it has a width; 0: double-clicks it.
    virtual void dragBorder(std::int32_t col, float width) = 0;
    /// F2 in the grid.
    virtual void editCell() = 0;
    /// Alt and an arrow in the grid: -1 to the left, 1 to the right.
    virtual void moveCurrentColumn(std::int32_t step) = 0;
    /// The focus goes to a field of the host's beside the control.
    virtual void leaveControl() = 0;
};

/// A failed comparison of boxes reads as their texts.
inline void PrintTo(const Stage::Box& box, std::ostream* out) {
    *out << zandor::platform::toUtf8(box.title) << " [" << box.style << "] "
         << zandor::platform::toUtf8(box.text);
}

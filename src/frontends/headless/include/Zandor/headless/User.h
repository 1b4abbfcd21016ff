#pragma once

#include <Zandor/headless/Toolkit.h>
#include <Zandor/headless/export.h>

#include <functional>

namespace zandor::platform::headless {

/// The user's hands. Only what a user could reach can be touched: something that does not exist, is
/// not shown, or lies outside an open dialog or menu is a std::logic_error. What is shown but
/// disabled can be touched without effect. Places are twips, entries count from 1.
class ZANDOR_HEADLESS_EXPORT User {
public:
    explicit User(Toolkit& toolkit) : mToolkit(toolkit) {}

    /// Called in each whole drag, of whatever it is, before the button comes up.
    std::function<void()> onHeld;

    void resizeControl(float width, float height);
    void repaint();

    void clickButton(const std::string& name);
    void focus(const std::string& name);
    void scrollBarTo(const std::string& name, std::int16_t value);
    /// Replaces the text of a text box.
    void type(const std::string& name, const String& text);
    void choose(const std::string& name, std::int16_t listIndex);
    /// Chooses an item from an open list, as a click on it does.
    void pick(const std::string& name, std::int16_t listIndex);
    /// Takes the first item of an open pick list that holds a text, as typing it and Enter do.
    void pickItem(const std::string& name, const String& text);
    /// A click with the left button on the field at the head of a grid's column.
    void clickField(const std::string& name, std::int32_t col);
    /// Drags a column by its field to the place of another one.
    void dragField(const std::string& name, std::int32_t col, std::int32_t to);
    /// Drags the right border of a column so that it has a width; 0: double-clicks the border.
    void dragBorder(const std::string& name, std::int32_t col, float width);
    /// F2 in a grid.
    void editCell(const std::string& name);
    /// Alt and an arrow in a grid: -1 to the left, 1 to the right.
    void moveCurrentColumn(const std::string& name, std::int32_t step);
    /// Types a text into a grid, with no editor open.
    void typeInGrid(const std::string& name, const String& text);
    /// The focus goes to something of the host's in the same window.
    void leaveControl();
    /// A key in an input. Enter presses the nearest default button; Escape closes a dialog once the
    /// input has had it.
    void key(const std::string& name, std::int16_t keyCode, std::int16_t shift = 0);
    /// By the window's frame.
    void closeDialog();

    /// By the title bar; moving is told half-way and at the end.
    void moveTable(const std::string& name, float left, float top);
    void resizeTable(const std::string& name, float width, float height);
    void closeTable(const std::string& name);
    void scrollList(const std::string& name, std::int32_t firstEntry);
    /// As clicks with Ctrl do, without the button events.
    void selectEntries(const std::string& name, const std::vector<std::int32_t>& entries);

    /// Entry 0 is an empty place of the list, where the left button without Ctrl deselects all.
    /// A press on an entry that is not selected selects it alone; with Ctrl it turns the entry's
    /// selection over.
    void pressEntry(const std::string& name, std::int32_t entry, std::int16_t button,
                    std::int16_t shift = 0);
    /// A release without Ctrl that follows a press of the left button leaves the entry as the only
    /// one selected. While a drag is on it is a drop.
    void releaseEntry(const std::string& name, std::int32_t entry, std::int16_t button,
                      std::int16_t shift = 0);
    /// Button is the sum of the buttons held. Told is the entry that was pressed.
    void moveOverEntry(const std::string& name, std::int32_t entry, std::int16_t button,
                       std::int16_t shift = 0);

    /// The second press of a double click with the left button; the first has been released.
    void doubleClickEntry(const std::string& name, std::int32_t entry);

    /// Moves a drag that is on over a place of a table list; nothing without a drag.
    void dragOver(const std::string& table, float X, float Y);
    /// Ends a drag over a place of a table list or the grid; nothing without a drag.
    void dropOn(const std::string& target, float X, float Y);
    /// Ends a drag where nothing takes it.
    void dropNowhere();
    /// A whole drag with the left button to an entry; 0 is an empty place of the list.
    void dragToEntry(const std::string& from, std::int32_t entry, const std::string& to,
                     std::int32_t target);
    /// A whole drag over an entry of another table on to the middle of a grid cell.
    void dragAcross(const std::string& from, std::int32_t entry, const std::string& across,
                    std::int32_t passed, const std::string& grid, std::int32_t row,
                    std::int32_t col);
    /// A whole drag with the left button to the middle of a grid cell.
    void dragToCell(const std::string& from, std::int32_t entry, const std::string& grid,
                    std::int32_t row, std::int32_t col);

    void pressFrame(const std::string& name, std::int16_t button, float X, float Y);
    void releaseFrame(const std::string& name, std::int16_t button, float X, float Y);

    void pressGrid(const std::string& name, std::int16_t button, float X, float Y);
    void releaseGrid(const std::string& name, std::int16_t button, float X, float Y);
    /// In the middle of a cell.
    void pressCell(const std::string& name, std::int16_t button, std::int32_t row,
                   std::int32_t col);
    void releaseCell(const std::string& name, std::int16_t button, std::int32_t row,
                     std::int32_t col);
    void scrollGrid(const std::string& name, std::int32_t topRow, std::int32_t leftCol);

private:
    /// Something that the user can reach now.
    template <class T>
    T& reach(const std::string& name) const {
        T& found = mToolkit.find<T>(name);
        mustReach(found);
        return found;
    }
    void mustReach(const Element& element) const;
    Tabulet& reachEntry(const std::string& name, std::int32_t entry) const;
    /// The table in the end, or nothing when it was taken back.
    Tabulet* dragFrame(const std::string& name, const Bounds& by);
    void beforeRelease() const;
    void leaveDragTarget();
    bool beginDragFrom(const std::string& table, std::int32_t entry);
    Bounds reachCell(const std::string& name, std::int32_t row, std::int32_t col) const;

    Toolkit& mToolkit;
    std::string mDragTarget; ///< the table list that a drag is over
    TalvikTabulet::Point mDragPoint;
    /// The last press on a table list.
    struct Press {
        std::string table;
        std::int32_t entry = 0;
        bool selected = false; ///< whether the entry was selected already
    } mPress;
};

} // namespace zandor::platform::headless

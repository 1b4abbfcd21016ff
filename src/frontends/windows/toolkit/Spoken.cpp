#include "frontends/windows/toolkit/Spoken.h"

#include "frontends/windows/toolkit/CanvasItems.h"
#include "frontends/windows/toolkit/ControlWindow.h"
#include "frontends/windows/toolkit/Frames.h"
#include "frontends/windows/toolkit/GridWindow.h"
#include "frontends/windows/toolkit/TableWindow.h"

#include <Zandor/comforts/Spoken.h>

#include <oleacc.h>

namespace zandor::platform::windows {

namespace {

constexpr LONG notInView = STATE_SYSTEM_OFFSCREEN | STATE_SYSTEM_INVISIBLE;

std::vector<HWND> shownIn(const Window& window) {
    std::vector<HWND> shown;
    for (HWND child = GetWindow(window.hwnd(), GW_CHILD); child;
         child = GetWindow(child, GW_HWNDNEXT))
        if (GetWindowLongW(child, GWL_STYLE) & WS_VISIBLE) shown.push_back(child);
    return shown;
}

bool isSeen(const RECT& place, const RECT& view) {
    RECT both{};
    return IntersectRect(&both, &place, &view) != FALSE;
}

String action() { return u"Press"; }

/// A window with nothing but windows in it.
class Group final : public Spoken {
public:
    explicit Group(Window& window) : mWindow(window) {}

    LONG role() const override { return ROLE_SYSTEM_GROUPING; }
    std::vector<HWND> windows() const override { return shownIn(mWindow); }
    SpokenPart part(int) const override { return {}; }

private:
    Window& mWindow;
};

class Entries final : public Spoken {
public:
    explicit Entries(EntryList& list) : mList(list) {}

    LONG role() const override { return ROLE_SYSTEM_LIST; }
    std::vector<HWND> windows() const override { return {}; }
    int count() const override { return mList.count(); }
    SpokenPart part(int number) const override {
        const int row = number - 1;
        const EntryLook look = mList.lookOf(row);
        const RECT place = mList.placeOf(row);
        LONG state = STATE_SYSTEM_SELECTABLE | STATE_SYSTEM_FOCUSABLE |
                     STATE_SYSTEM_MULTISELECTABLE | STATE_SYSTEM_EXTSELECTABLE;
        if (mList.isSelected(row)) state |= STATE_SYSTEM_SELECTED;
        if (GetFocus() == mList.hwnd() && mList.caret() == row) state |= STATE_SYSTEM_FOCUSED;
        if (!isSeen(place, mList.area())) state |= notInView;
        const comforts::EntryWords words(mList.surroundings().words);
        return {.name = mList.textOf(row),
                .description = comforts::spokenOfEntry(words, look.picture, look.comesOut),
                .value = {},
                .role = ROLE_SYSTEM_LISTITEM,
                .state = state,
                .place = place,
                .action = action()};
    }
    int partAt(POINT at) const override { return mList.rowAt(at) + 1; }
    int focused() const override { return mList.caret() + 1; }
    std::vector<int> selected() const override {
        std::vector<int> numbers = mList.selected();
        for (int& number : numbers) ++number;
        return numbers;
    }
    void press(int number) override { mList.open(number - 1); }
    bool select(int number, LONG how) override {
        mList.take(number - 1, how);
        return true;
    }

private:
    EntryList& mList;
};

class Table final : public Spoken {
public:
    explicit Table(TableWindow& box) : mBox(box) {}

    LONG role() const override { return ROLE_SYSTEM_WINDOW; }
    std::vector<HWND> windows() const override { return shownIn(mBox); }
    int count() const override { return mBox.isLocked() ? 0 : 1; }
    SpokenPart part(int) const override {
        return {.name = mBox.surroundings().words.RemoveTable,
                .description = {},
                .value = {},
                .role = ROLE_SYSTEM_PUSHBUTTON,
                .state = 0,
                .place = mBox.crossPlace(),
                .action = action()};
    }
    int partAt(POINT at) const override {
        const RECT cross = mBox.crossPlace();
        return count() > 0 && PtInRect(&cross, at) ? 1 : 0;
    }
    void press(int) override { mBox.pressCross(); }

private:
    TableWindow& mBox;
};

class Drawing final : public Spoken {
public:
    explicit Drawing(Canvas& canvas) : mCanvas(canvas) {}

    LONG role() const override { return ROLE_SYSTEM_DIAGRAM; }
    std::vector<HWND> windows() const override {
        std::vector<HWND> boxes;
        for (const TableWindow* const table : mCanvas.tables()) boxes.push_back(table->hwnd());
        return boxes;
    }
    int count() const override { return static_cast<int>(mCanvas.lines().size()); }
    SpokenPart part(int number) const override {
        CanvasLine& line = at(number);
        const RECT place = line.place();
        LONG state = STATE_SYSTEM_FOCUSABLE;
        if (GetFocus() == mCanvas.hwnd() && mCanvas.currentLine() == &line)
            state |= STATE_SYSTEM_FOCUSED;
        if (!isSeen(place, mCanvas.surroundings().seen())) state |= notInView;
        String sentence = line.notes().Sentence;
        // Last, for the model is asked for it.
        String name = mCanvas.surroundings().comforts.spokenName(line);
        return {.name = std::move(name),
                .description = std::move(sentence),
                .value = {},
                .role = ROLE_SYSTEM_GRAPHIC,
                .state = state,
                .place = place,
                .action = action()};
    }
    int partAt(POINT at) const override {
        constexpr float reach = 50; // twips
        const Scale& scale = mCanvas.surroundings().scale;
        const auto lines = mCanvas.lines();
        for (std::size_t n = 0; n < lines.size(); ++n)
            if (lines[n]->distanceTo({scale.toTwips(at.x), scale.toTwips(at.y)}) < reach)
                return static_cast<int>(n) + 1;
        return 0;
    }
    int focused() const override {
        const auto lines = mCanvas.lines();
        for (std::size_t n = 0; n < lines.size(); ++n)
            if (lines[n] == mCanvas.currentLine()) return static_cast<int>(n) + 1;
        return 0;
    }
    void press(int number) override {
        mCanvas.focusOn(&at(number));
        mCanvas.openCurrentLine();
    }
    bool select(int number, LONG how) override {
        if (how != SELFLAG_TAKEFOCUS) return false;
        mCanvas.focusOn(&at(number));
        return true;
    }

private:
    CanvasLine& at(int number) const {
        return *mCanvas.lines().at(static_cast<std::size_t>(number) - 1);
    }

    Canvas& mCanvas;
};

/// All cells row by row, with their titles.
class Cells final : public Spoken {
public:
    explicit Cells(GridWindow& grid) : mGrid(grid) {}

    LONG role() const override { return ROLE_SYSTEM_TABLE; }
    std::vector<HWND> windows() const override { return {}; }
    int count() const override { return mGrid.cells().rows() * mGrid.cells().cols(); }
    SpokenPart part(int number) const override {
        const std::int32_t row = rowOf(number);
        const std::int32_t col = colOf(number);
        const GridCells& cells = std::as_const(mGrid).cells();
        const RECT place = mGrid.cellPlace(row, col);
        const bool title = row == 0 || col == 0;
        LONG state = title ? 0 : STATE_SYSTEM_FOCUSABLE | STATE_SYSTEM_SELECTABLE;
        if (row == mGrid.currentRow() && col == mGrid.currentCol()) {
            if (!title) state |= STATE_SYSTEM_SELECTED;
            if (GetFocus() == mGrid.hwnd()) state |= STATE_SYSTEM_FOCUSED;
        }
        const bool scrolledAway =
            (row > 0 && row < mGrid.topRow()) || (col > 0 && col < mGrid.leftCol());
        if (scrolledAway || !isSeen(place, mGrid.area())) state |= notInView;
        const auto& cell = cells.cell(row, col);
        const comforts::CellText text = [&](std::int32_t r, std::int32_t c) {
            return cells.cell(r, c).text;
        };
        return {.name = title ? cell.text
                              : comforts::nameOfCell(mGrid.surroundings().words, text, row, col),
                .description = cell.note,
                .value = title ? String() : cell.text,
                .role = col == 0   ? ROLE_SYSTEM_ROWHEADER
                        : row == 0 ? ROLE_SYSTEM_COLUMNHEADER
                                   : ROLE_SYSTEM_CELL,
                .state = state,
                .place = place,
                .action = title ? String() : action()};
    }
    int partAt(POINT at) const override {
        const auto [row, col] = mGrid.cellAt(at);
        return row < 0 || col < 0 ? 0 : numberOf(row, col);
    }
    int focused() const override { return numberOf(mGrid.currentRow(), mGrid.currentCol()); }
    std::vector<int> selected() const override { return {focused()}; }
    void press(int number) override {
        if (!go(number)) return;
        mGrid.openEditor();
    }
    bool select(int number, LONG how) override {
        if (how & (SELFLAG_ADDSELECTION | SELFLAG_REMOVESELECTION | SELFLAG_EXTENDSELECTION))
            return false;
        return go(number);
    }

private:
    std::int32_t rowOf(int number) const { return (number - 1) / mGrid.cells().cols(); }
    std::int32_t colOf(int number) const { return (number - 1) % mGrid.cells().cols(); }
    int numberOf(std::int32_t row, std::int32_t col) const {
        return row * mGrid.cells().cols() + col + 1;
    }
    bool go(int number) {
        if (rowOf(number) == 0 || colOf(number) == 0) return false;
        SetFocus(mGrid.hwnd());
        if (!mGrid.isAlive()) return false;
        mGrid.walkTo(rowOf(number), colOf(number));
        return true;
    }

    GridWindow& mGrid;
};

template <class Kind, class W>
bool make(std::unique_ptr<Spoken>& made, Window& window) {
    auto* const it = dynamic_cast<W*>(&window);
    if (it) made = std::make_unique<Kind>(*it);
    return it != nullptr;
}

} // namespace

std::unique_ptr<Spoken> spokenOf(Window& window) {
    std::unique_ptr<Spoken> made;
    (void)(make<Entries, EntryList>(made, window) || make<Table, TableWindow>(made, window) ||
           make<Drawing, Canvas>(made, window) || make<Cells, GridWindow>(made, window) ||
           make<Group, ControlWindow>(made, window) || make<Group, RowWindow>(made, window));
    return made;
}

} // namespace zandor::platform::windows

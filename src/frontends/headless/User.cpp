#include <Zandor/headless/User.h>

#include <algorithm>

namespace zandor::platform::headless {

namespace {

constexpr std::int16_t keyEnter = 13;

CommandButton* defaultButtonIn(const Element& inside) {
    for (Element* child : inside.children()) {
        if (CommandButton* deeper = defaultButtonIn(*child)) return deeper;
        auto* button = dynamic_cast<CommandButton*>(child);
        if (button && button->isDefault() && button->shown() && button->usable()) return button;
    }
    return nullptr;
}

/// The default button nearest to an input: in its container, or in what that stands in.
CommandButton* defaultButtonFor(const Element& input) {
    for (const Element* at = input.container(); at; at = at->container())
        if (CommandButton* button = defaultButtonIn(*at)) return button;
    return nullptr;
}

void press(const CommandButton& button) {
    // The handler may take the button away.
    if (const PlainEvent click = button.events.Click) click();
}

} // namespace

void User::mustReach(const Element& element) const {
    if (!element.shown()) throw std::logic_error(element.name() + " is not shown");
    if (mToolkit.menuOpen()) throw std::logic_error("an open menu keeps " + element.name());
    if (const Dialog* dialog = mToolkit.dialog(); dialog && !element.isInside(*dialog))
        throw std::logic_error("an open dialog keeps " + element.name());
}

void User::resizeControl(float width, float height) {
    mToolkit.surface().resize(width, height);
    if (mToolkit.onResize) mToolkit.onResize();
}

void User::repaint() {
    if (mToolkit.onPaint) mToolkit.onPaint();
}

void User::clickButton(const std::string& name) {
    if (auto& button = reach<CommandButton>(name); button.usable()) button.takeFocus();
    // Its GotFocus may have hidden or disabled it.
    if (auto& button = mToolkit.find<CommandButton>(name); button.shown() && button.usable())
        press(button);
}

void User::focus(const std::string& name) {
    if (auto& element = reach<Element>(name); element.usable()) element.takeFocus();
}

void User::scrollBarTo(const std::string& name, std::int16_t value) {
    if (auto& bar = reach<ScrollBar>(name); bar.usable()) bar.takeFocus();
    if (auto& bar = mToolkit.find<ScrollBar>(name); bar.usable()) bar.scrollTo(value);
}

void User::type(const std::string& name, const String& text) {
    auto& box = reach<TextBox>(name);
    if (!box.usable()) return;
    box.takeFocus();
    box.type(text);
}

void User::choose(const std::string& name, std::int16_t listIndex) {
    auto& combo = reach<ComboBox>(name);
    if (!combo.usable()) return;
    if (listIndex < 0 || listIndex >= static_cast<std::int32_t>(combo.items().size()))
        throw std::logic_error(name + " has no such item");
    combo.takeFocus();
    combo.choose(listIndex);
}

void User::pick(const std::string& name, std::int16_t listIndex) {
    choose(name, listIndex);
    mToolkit.comforts.choiceMade();
}

void User::pickItem(const std::string& name, const String& text) {
    auto& list = reach<PickList>(name);
    const auto& items = list.items();
    const auto at = std::find_if(items.begin(), items.end(), [&](const String& item) {
        return item.find(text) != String::npos;
    });
    if (at == items.end()) throw std::logic_error(name + " has no such item");
    list.pick(static_cast<std::int32_t>(at - items.begin()));
}

void User::clickField(const std::string& name, std::int32_t col) {
    pressCell(name, leftButton, 0, col);
    releaseCell(name, leftButton, 0, col);
    mToolkit.comforts.fieldClicked(col);
}

void User::dragField(const std::string& name, std::int32_t col, std::int32_t to) {
    pressCell(name, leftButton, 0, col);
    const bool moves = mToolkit.comforts.columnMovable(col);
    beforeRelease();
    releaseCell(name, leftButton, 0, to);
    if (moves) mToolkit.comforts.columnMoved(col, to);
}

void User::dragBorder(const std::string& name, std::int32_t col, float width) {
    if (width == 0) {
        mToolkit.comforts.borderDoubleClicked(col);
        return;
    }
    reach<Grid>(name).resizeColumn(col, width);
    beforeRelease();
    mToolkit.comforts.borderDragged(col, width);
}

void User::editCell(const std::string& name) {
    auto& grid = reach<Grid>(name);
    grid.takeFocus();
    if (mToolkit.comforts.cellOpened()) return;
    const Bounds at = grid.currentCell();
    pressGrid(name, leftButton, at.Left + at.Width / 2, at.Top + at.Height / 2);
}

void User::moveCurrentColumn(const std::string& name, std::int32_t step) {
    reach<Grid>(name).takeFocus();
    mToolkit.comforts.currentColumnMoved(step);
}

void User::typeInGrid(const std::string& name, const String& text) {
    reach<Grid>(name).takeFocus();
    mToolkit.comforts.cellTyped(text);
}

void User::leaveControl() {
    mToolkit.moveFocus(nullptr);
    mToolkit.comforts.editorLeft();
}

void User::key(const std::string& name, std::int16_t keyCode, std::int16_t shift) {
    auto& element = reach<Element>(name);
    auto& input = mToolkit.find<Input>(name);
    if (!element.usable()) return;
    element.takeFocus();
    // In a dialog the keys are the dialog's.
    const auto* box = dynamic_cast<const TextBox*>(&element);
    const bool atEnd = !box || !box->allSelected();
    const bool atStart = !box || (atEnd && box->look().text.empty());
    if (!mToolkit.dialog() && mToolkit.comforts.editorKey(keyCode, shift, atStart, atEnd)) return;
    if (CommandButton* button = keyCode == keyEnter ? defaultButtonFor(element) : nullptr) {
        press(*button);
        return;
    }
    Dialog* const dialog = mToolkit.dialog();
    input.keyDown(keyCode, shift);
    if (keyCode == keyEscape && dialog && dialog == mToolkit.dialog() && dialog->shown())
        dialog->close();
}

void User::closeDialog() {
    Dialog* const dialog = mToolkit.dialog();
    if (!dialog || !dialog->shown()) throw std::logic_error("no dialog is open");
    dialog->close();
}

Tabulet* User::dragFrame(const std::string& name, const Bounds& by) {
    if (auto& table = reach<Tabulet>(name); table.usable()) table.takeFocus();
    const Bounds start = reach<Tabulet>(name).placement();
    reach<Tabulet>(name).grasp();
    for (const float part : {0.5F, 1.0F})
        // What the step before told may have taken the table away.
        reach<Tabulet>(name).drag({start.Left + part * by.Left, start.Top + part * by.Top,
                                   start.Width + part * by.Width, start.Height + part * by.Height});
    beforeRelease();
    auto& table = reach<Tabulet>(name);
    return table.letGo() ? &table : nullptr;
}

void User::beforeRelease() const {
    if (onHeld) onHeld();
}

void User::moveTable(const std::string& name, float left, float top) {
    const Bounds at = reach<Tabulet>(name).placement();
    if (reach<Tabulet>(name).locked()) return;
    const auto* table = dragFrame(name, {left - at.Left, top - at.Top, 0, 0});
    if (table && table->events.Moved) table->events.Moved(table->index);
}

void User::resizeTable(const std::string& name, float width, float height) {
    const Bounds at = reach<Tabulet>(name).placement();
    if (reach<Tabulet>(name).locked()) return;
    const auto* table = dragFrame(name, {0, 0, width - at.Width, height - at.Height});
    if (table && table->events.Resized) table->events.Resized(table->index);
}

void User::closeTable(const std::string& name) {
    auto& table = reach<Tabulet>(name);
    if (!table.locked() && table.events.CloseClick) table.events.CloseClick(table.index);
}

void User::scrollList(const std::string& name, std::int32_t firstEntry) {
    reach<Tabulet>(name).scrollTo(firstEntry);
}

void User::selectEntries(const std::string& name, const std::vector<std::int32_t>& entries) {
    auto& table = reach<Tabulet>(name);
    for (std::size_t i = 1; i <= table.entries().size(); ++i)
        table.entry(static_cast<std::int32_t>(i)).select(false);
    for (const std::int32_t entry : entries) table.entry(entry).select(true);
}

void User::pressFrame(const std::string& name, std::int16_t button, float X, float Y) {
    auto& frame = reach<Frame>(name);
    for (const Element* child : frame.children()) {
        const Bounds& at = child->placement();
        const bool covers = child->shown() && dynamic_cast<const Tabulet*>(child) && X >= at.Left &&
                            X < at.Left + at.Width && Y >= at.Top && Y < at.Top + at.Height;
        if (covers) throw std::logic_error(child->name() + " covers the place pressed");
    }
    if (frame.events.MouseDown) frame.events.MouseDown(button, 0, X, Y);
}

void User::releaseFrame(const std::string& name, std::int16_t button, float X, float Y) {
    auto& frame = reach<Frame>(name);
    if (frame.events.MouseUp) frame.events.MouseUp(button, 0, X, Y);
}

void User::pressGrid(const std::string& name, std::int16_t button, float X, float Y) {
    auto& grid = reach<Grid>(name);
    grid.takeFocus();
    if (mToolkit.comforts.gridPressed(button, X, Y)) return;
    if (grid.events.MouseDown) grid.events.MouseDown(button, 0, X, Y);
}

void User::releaseGrid(const std::string& name, std::int16_t button, float X, float Y) {
    auto& grid = reach<Grid>(name);
    if (grid.events.MouseUp) grid.events.MouseUp(button, 0, X, Y);
}

Bounds User::reachCell(const std::string& name, std::int32_t row, std::int32_t col) const {
    auto& grid = reach<Grid>(name);
    if (!grid.inView(row, col)) throw std::logic_error("the cell is scrolled out of view");
    return grid.cellBounds(row, col);
}

void User::pressCell(const std::string& name, std::int16_t button, std::int32_t row,
                     std::int32_t col) {
    const Bounds at = reachCell(name, row, col);
    pressGrid(name, button, at.Left + at.Width / 2, at.Top + at.Height / 2);
}

void User::releaseCell(const std::string& name, std::int16_t button, std::int32_t row,
                       std::int32_t col) {
    const Bounds at = reachCell(name, row, col);
    releaseGrid(name, button, at.Left + at.Width / 2, at.Top + at.Height / 2);
}

void User::scrollGrid(const std::string& name, std::int32_t topRow, std::int32_t leftCol) {
    reach<Grid>(name).scrollTo(topRow, leftCol);
}

} // namespace zandor::platform::headless

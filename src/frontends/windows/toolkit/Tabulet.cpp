#include "frontends/windows/toolkit/Tabulet.h"

#include "frontends/windows/toolkit/Canvas.h"
#include "frontends/windows/toolkit/Drawing.h"

#include <Zandor/platform/RuntimeError.h>

#include <algorithm>
#include <atomic>
#include <cmath>

namespace zandor::platform::windows {

namespace {

std::int32_t newHandle() {
    static std::atomic<std::int32_t> last = 0;
    return ++last;
}

} // namespace

/// An entry may outlive its list; it then keeps what it last said.
class Tabulet::Entry final : public TalvikTabulet::ColumnItem {
public:
    Entry(Tabulet& table, int row, String key, String text)
        : mTable(&table), mRow(row), mKey(std::move(key)), mText(std::move(text)) {}

    void detach() {
        mSelected = Selected();
        mTable = nullptr;
    }
    const EntryLook& look() const { return mLook; }

    const String& Text() const override { return mText; }
    const String& Key() const override { return mKey; }
    bool Selected() const override { return mTable ? list().isSelected(mRow) : mSelected; }
    void Selected(bool value) override {
        mSelected = value;
        if (!mTable) return;
        if (value) mTable->mEntryTaken = true;
        list().select(mRow, value);
    }
    void Image(std::int16_t value) override {
        mLook.picture = mTable && mTable->mImages ? mTable->mImages->Image(value) : std::nullopt;
        repaint();
    }
    void ComesOut(bool value) override {
        mLook.comesOut = value;
        repaint();
    }
    void Refresh() override { repaint(); }
    void EnsureVisible() override { table().mWindow->list().reveal(mRow); }
    TalvikTabulet::Point LeftEdgePoint() const override { return edge(0); }
    TalvikTabulet::Point RightEdgePoint() const override { return edge(1); }

private:
    Tabulet& table() const {
        if (!mTable) throw errors::objectNotSet();
        return *mTable;
    }
    EntryList& list() const { return mTable->mWindow->list(); }
    void repaint() const {
        if (mTable) list().repaintRow(mRow);
    }
    TalvikTabulet::Point edge(float side) const {
        const Bounds box = table().bounds();
        const TableWindow& window = *mTable->mWindow;
        const double middle =
            window.listTop() + window.list().rowHeight() * (mRow - window.list().top() + 0.5);
        return {box.Left + side * box.Width,
                box.Top + mTable->surroundings().scale.toTwips(middle)};
    }

    Tabulet* mTable;
    const int mRow;
    const String mKey;
    const String mText;
    EntryLook mLook;
    bool mSelected = false;
};

Tabulet::Tabulet(std::shared_ptr<TableWindow> window, std::int16_t index,
                 const TalvikTabulet::TabuletEvents& events)
    : Constituent(std::move(window)), mIndex(index), mHandle(newHandle()), mEvents(events) {
    mWindow->setListener(this);
}

Tabulet::~Tabulet() { Unload(); }

void Tabulet::Unload() {
    dropEntries();
    mWindow->setListener(nullptr);
    surroundings().drags.forget(this);
    if (surroundings().currentTable == mWindow.get()) surroundings().currentTable = nullptr;
    mWindow->end();
}

void Tabulet::dropEntries() {
    for (const auto& entry : mEntries) entry->detach();
    mEntries.clear();
    if (mWindow->isAlive()) mWindow->list().clear();
}

void Tabulet::takeLookOf(const Tabulet& pattern) {
    if (pattern.mWindow->hasOwnFont()) mWindow->setFont(pattern.mWindow->font());
    mImages = pattern.mImages;
    mWindow->setLocked(pattern.mWindow->isLocked());
}

void Tabulet::Text(const String& value) {
    mText = value;
    mWindow->setTitle(value);
}

void Tabulet::Visible(bool value) {
    mVisible = value;
    mWindow->show(value);
}

void Tabulet::Activated(bool value) {
    TableWindow*& current = surroundings().currentTable;
    if (value) {
        if (current && current != mWindow.get()) current->setCurrent(false);
        current = mWindow.get();
    } else if (current == mWindow.get()) {
        current = nullptr;
    }
    mWindow->setCurrent(value);
}

Ref<TalvikTabulet::ColumnItem> Tabulet::ColumnAt(float X, float Y) const {
    if (!mWindow->isAlive()) return {};
    const auto pixel = static_cast<double>(surroundings().scale.toTwips(1));
    POINT at{static_cast<LONG>(std::floor(static_cast<double>(X) / pixel)),
             static_cast<LONG>(std::floor(static_cast<double>(Y) / pixel))};
    MapWindowPoints(mWindow->hwnd(), mWindow->list().hwnd(), &at, 1);
    const int row = mWindow->list().rowAt(at);
    if (row < 0) return {};
    return Item(row + 1);
}

void Tabulet::Drag(std::int16_t action) {
    if (action == 0) surroundings().drags.giveUp(this);
    if (action != 1 || !mWindow->isAlive()) return;
    const EntryList& list = mWindow->list();
    std::vector<String> names;
    for (const int row : list.selected()) names.push_back(list.textOf(row));
    surroundings().drags.request(this, std::move(names));
}

void Tabulet::Complete() { mWindow->list().repaint(); }

Ref<TalvikTabulet::ColumnItem> Tabulet::Item(std::int32_t position) const {
    if (position < 1 || position > Count()) throw errors::subscriptOutOfRange();
    return std::shared_ptr<TalvikTabulet::ColumnItem>(
        mEntries[static_cast<std::size_t>(position) - 1]);
}

Ref<TalvikTabulet::ColumnItem> Tabulet::Add(const String& key, const String& text) {
    mEntries.push_back(makeRef<Entry>(*this, Count(), key, text));
    if (mWindow->isAlive()) mWindow->list().add(text);
    return Item(Count());
}

std::vector<Ref<TalvikTabulet::ColumnItem>> Tabulet::Selected() const {
    std::vector<Ref<TalvikTabulet::ColumnItem>> selected;
    for (const int row : mWindow->list().selected()) selected.push_back(Item(row + 1));
    return selected;
}

EntryLook Tabulet::lookOf(int row) const {
    return row < Count() ? mEntries[static_cast<std::size_t>(row)]->look() : EntryLook{};
}

void Tabulet::report(const TalvikTabulet::TabuletEvents::Mouse& handler, int row,
                     std::int16_t button, std::int16_t shift) {
    if (!handler || row >= Count()) return;
    // Held: the handler may end the table.
    Ref<TalvikTabulet::ColumnItem> entry;
    if (row >= 0) entry = Item(row + 1);
    handler(mIndex, entry, button, shift);
}

void Tabulet::entryPressed(int row, std::int16_t button, std::int16_t shift) {
    report(mEvents.ColumnMouseDown, row, button, shift);
}

void Tabulet::entryMoved(int row, std::int16_t buttons, std::int16_t shift) {
    report(mEvents.ColumnMouseMove, row, buttons, shift);
}

void Tabulet::entryReleased(int row, std::int16_t button, std::int16_t shift) {
    report(mEvents.ColumnMouseUp, row, button, shift);
}

void Tabulet::entryDoubleClicked(int row) {
    surroundings().comforts.entryDoubleClicked(mIndex, row + 1);
}

void Tabulet::selectionChanged() {
    if (mEvents.SelectionChanged) mEvents.SelectionChanged(mIndex);
}

void Tabulet::listScrolled() {
    if (mEvents.Scroll) mEvents.Scroll(mIndex);
}

void Tabulet::listGotFocus() {
    if (mEvents.GotFocus) mEvents.GotFocus(mIndex);
}

void Tabulet::menuKey(int row, POINT at) {
    surroundings().menu.openAt(at, [&] { entryReleased(row, rightButton, 0); });
}

void Tabulet::deleteKey(int row) {
    surroundings().menu.choose(menuentry::deleteTable, [&] { entryReleased(row, rightButton, 0); });
}

void Tabulet::closeClicked() {
    if (mEvents.CloseClick) mEvents.CloseClick(mIndex);
}

void Tabulet::titleClicked() { surroundings().comforts.titleClicked(mIndex); }

void Tabulet::gestureMoved(unsigned edges, POINT way) {
    const Scale& scale = surroundings().scale;
    const SIZE smallest = mWindow->smallest();
    const Bounds box = mGesture.at(edges, scale.toTwips(way.x), scale.toTwips(way.y),
                                   scale.toTwips(smallest.cx), scale.toTwips(smallest.cy));
    if (box == bounds()) return;
    setBounds(box);
    if (mEvents.Moving) mEvents.Moving(mIndex);
}

void Tabulet::gestureEnded(unsigned edges) {
    mGesture.end(edges, *this, mEvents, mIndex, [window = mWindow] { return window->isAlive(); });
}

void Tabulet::gestureTakenBack() {
    setBounds(mGesture.start());
    if (mEvents.Moving) mEvents.Moving(mIndex);
}

bool Tabulet::draggedOver(POINT at, DragState state) {
    auto& comforts = surroundings().comforts;
    const Scale scale = surroundings().scale;
    if (state == DragState::enters) comforts.dragCame(mIndex);
    mEntryTaken = false;
    const std::shared_ptr<TableWindow> window = mWindow;
    if (mEvents.DragOver)
        mEvents.DragOver(mIndex, surroundings().drags.source(), scale.toTwips(at.x),
                         scale.toTwips(at.y), static_cast<std::int16_t>(state));
    // The control answers by selecting the entry under the mouse if it can be dropped on. The drop
    // goes to the control either way; the cursor tells the user beforehand.
    if (!window->isAlive()) return false;
    if (state == DragState::leaves) comforts.dragGone();
    return mEntryTaken;
}

void Tabulet::dropped(POINT at) {
    const std::shared_ptr<TableWindow> window = mWindow;
    auto& around = window->surroundings();
    const bool taken = mEntryTaken;
    if (mEvents.DragDrop)
        mEvents.DragDrop(mIndex, around.drags.source(), around.scale.toTwips(at.x),
                         around.scale.toTwips(at.y));
    taken ? around.comforts.dragTaken() : around.comforts.dragGone();
}

} // namespace zandor::platform::windows

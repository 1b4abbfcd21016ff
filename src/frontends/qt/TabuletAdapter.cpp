#include "frontends/qt/TabuletAdapter.h"

#include "frontends/qt/ColumnListModel.h"
#include "frontends/qt/DragSession.h"
#include "frontends/qt/Fonts.h"
#include "frontends/qt/KeyCodes.h"
#include "frontends/qt/KeyboardMenu.h"

#include <Zandor/platform/RuntimeError.h>
#include <Zandor/qt/Text.h>

#include <algorithm>
#include <atomic>

namespace zandor::platform::qt {

namespace {

std::int32_t nextHandle() {
    static std::atomic<std::int32_t> last{0};
    return ++last;
}

} // namespace

/// An entry is made when somebody asks for it, and is there as long as somebody holds it. It may
/// outlive its list; it then keeps what it last said.
class TabuletAdapter::Entry final : public TableEntry, public std::enable_shared_from_this<Entry> {
public:
    Entry(TabuletAdapter& table, int row) : mTable(&table), mRow(row) {}
    ~Entry() override {
        if (mTable) mTable->mEntries.forget(mRow);
    }

    void detach() {
        said();
        mSelected = Selected();
        mTable = nullptr;
    }

    const String& Text() const override { return said().text; }
    const String& Key() const override { return said().key; }

    bool Selected() const override {
        if (!live()) return mSelected;
        // Without a list nothing was selected.
        const ColumnListView* const made = mTable->mWidget->madeList();
        return made && made->selectionModel()->isSelected(index());
    }

    void Selected(bool value) override {
        mSelected = value;
        if (mTable && value) mTable->mEntryTaken = true;
        if (live() && value != Selected())
            list().selectionModel()->select(index(), value ? QItemSelectionModel::Select
                                                           : QItemSelectionModel::Deselect);
    }

    void Image(std::int16_t value) override {
        if (!live()) return;
        const auto& images = mTable->mImages;
        mTable->mWidget->model().setPicture(mRow, images ? images->Image(value) : std::nullopt);
    }

    void ComesOut(bool value) override {
        if (live()) mTable->mWidget->model().setComesOut(mRow, value);
    }

    void Refresh() override {
        if (live() && mTable->mWidget->madeList()) list().update(index());
    }

    void EnsureVisible() override {
        if (live()) list().scrollTo(index());
    }

    TalvikTabulet::Point LeftEdgePoint() const override {
        if (mTable) mTable->mSurroundings.asked.east = weak_from_this();
        return edge(0);
    }
    TalvikTabulet::Point RightEdgePoint() const override {
        if (mTable) mTable->mSurroundings.asked.west = weak_from_this();
        return edge(1);
    }

    const TalvikTabulet::Tabulet* table() const override { return mTable; }
    Ref<TalvikTabulet::ColumnItem> held() { return shared_from_this(); }

private:
    bool live() const { return mTable && mTable->mWidget; }
    ColumnListView& list() const { return mTable->mWidget->list(); }
    QModelIndex index() const { return mTable->mWidget->model().index(mRow); }

    TalvikTabulet::Point edge(float side) const {
        if (!live()) throw errors::objectNotSet();
        const Bounds box = mTable->bounds();
        const auto row = static_cast<float>(mTable->mWidget->rowHeight());
        const float middle = static_cast<float>(mTable->mWidget->firstEntry()) +
                             row * (static_cast<float>(mRow) + 0.5F);
        return {box.Left + side * box.Width, box.Top + middle * twipsPerPixel};
    }

    struct Said {
        String key, text;
    };
    const Said& said() const {
        if (mSaid) return *mSaid;
        const EntryTexts& texts = mTable->mEntries.texts();
        mSaid = std::make_unique<const Said>(Said{texts.key(mRow), texts.text(mRow)});
        return *mSaid;
    }

    TabuletAdapter* mTable;
    const int mRow;
    mutable std::unique_ptr<const Said> mSaid;
    bool mSelected = false;
};

int TabuletAdapter::Entries::rowOf(std::int32_t position) const {
    if (position < 1 || position > Count()) throw errors::subscriptOutOfRange();
    return position - 1;
}

Ref<TalvikTabulet::ColumnItem> TabuletAdapter::Entries::Item(std::int32_t position) const {
    const int row = rowOf(position);
    if (const auto held = mHeld.find(row); held != mHeld.end()) return held->second->held();
    const auto entry = std::make_shared<Entry>(mTable, row);
    mHeld.emplace(row, entry.get());
    return entry;
}

bool TabuletAdapter::Entries::Reads(std::int32_t position, StringView text) const {
    return mTexts->reads(rowOf(position), text);
}

bool TabuletAdapter::Entries::IsAt(std::int32_t position,
                                   const TalvikTabulet::ColumnItem& entry) const {
    const auto held = mHeld.find(rowOf(position));
    return held != mHeld.end() && held->second == &entry;
}

Ref<TalvikTabulet::ColumnItem> TabuletAdapter::Entries::Add(const String& key, const String& text) {
    if (mTable.mWidget)
        mTable.mWidget->model().append(text, key);
    else
        mTexts->add(key, text);
    return Item(Count());
}

void TabuletAdapter::Entries::dropAll() {
    for (const auto& [row, entry] : mHeld) entry->detach();
    mHeld.clear();
    if (mTable.mWidget)
        mTable.mWidget->model().clear();
    else
        mTexts->clear();
}

std::vector<Ref<TalvikTabulet::ColumnItem>> TabuletAdapter::Entries::Selected() const {
    std::vector<Ref<TalvikTabulet::ColumnItem>> selected;
    if (!mTable.mWidget || !mTable.mWidget->madeList()) return selected;
    QModelIndexList rows = mTable.mWidget->list().selectionModel()->selectedIndexes();
    std::sort(rows.begin(), rows.end());
    for (const QModelIndex& row : rows) selected.push_back(Item(row.row() + 1));
    return selected;
}

TabuletAdapter::TabuletAdapter(TabuletWidget* widget, FocusTracker& focus,
                               TabuletSurroundings& surroundings, std::int16_t index,
                               const TalvikTabulet::TabuletEvents& events)
    : Adapter(widget, focus), mSurroundings(surroundings), mDrags(surroundings.drags),
      mIndex(index), mHandle(nextHandle()), mEvents(events),
      mEntries(*this, widget->model().texts()) {
    widget->setListener(this);
}

TabuletAdapter::~TabuletAdapter() { leave(); }

void TabuletAdapter::leave() {
    Terminate();
    mDrags.forget(this);
    if (mSurroundings.current == this) mSurroundings.current = nullptr;
    if (!mWidget) return;
    mWidget->setListener(nullptr);
    if (mWidget->madeList()) mFocus.forget(mWidget->madeList());
    dropWidget();
}

void TabuletAdapter::Unload() { leave(); }

void TabuletAdapter::Text(const String& value) {
    mText = value;
    if (mWidget) mWidget->setTitle(toQt(value));
}

void TabuletAdapter::Visible(bool value) {
    mVisible = value;
    show(value);
}

void TabuletAdapter::Activated(bool value) {
    if (value && mSurroundings.current && mSurroundings.current != this)
        mSurroundings.current->Activated(false);
    if (value)
        mSurroundings.current = this;
    else if (mSurroundings.current == this)
        mSurroundings.current = nullptr;
    if (mWidget) mWidget->setCurrent(value);
}

void TabuletAdapter::Locked(bool value) {
    if (mWidget) mWidget->setLocked(value);
}

void TabuletAdapter::Font(const platform::Font& value) {
    if (mWidget) setFont(*mWidget, value);
}

Ref<TalvikTabulet::ColumnItem> TabuletAdapter::ColumnAt(float X, float Y) const {
    if (!mWidget) return {};
    const QPoint at(static_cast<int>(std::floor(X / twipsPerPixel)),
                    static_cast<int>(std::floor(Y / twipsPerPixel)));
    const ColumnListView& view = mWidget->list();
    const QPoint inside = view.viewport()->mapFrom(mWidget.data(), at);
    if (!view.viewport()->rect().contains(inside)) return {};
    const QModelIndex index = view.indexAt(inside);
    if (!index.isValid()) return {};
    return mEntries.Item(index.row() + 1);
}

void TabuletAdapter::ZOrder() {
    if (mWidget) mWidget->raise();
}

void TabuletAdapter::Drag(std::int16_t action) {
    if (action == 0) mDrags.giveUp(this);
    if (action != 1 || !mWidget) return;
    QStringList names;
    for (const auto& entry : mEntries.Selected()) names += toQt(entry->Text());
    mDrags.request(&mWidget->list(), this, names);
}

void TabuletAdapter::Complete() {
    if (!mWidget) return;
    mWidget->model().squeeze();
    // Laid out at once: the ends of join lines depend on how far the list is scrolled.
    mWidget->layOut();
}

void TabuletAdapter::Terminate() { mEntries.dropAll(); }

void TabuletAdapter::report(const TalvikTabulet::TabuletEvents::Mouse& handler, int row,
                            std::int16_t button, std::int16_t shift) {
    if (!handler || row >= mEntries.Count()) return;
    // A copy: the handler may end the table.
    Ref<TalvikTabulet::ColumnItem> entry;
    if (row >= 0) entry = mEntries.Item(row + 1);
    handler(mIndex, entry, button, shift);
}

void TabuletAdapter::entryPressed(int row, std::int16_t button, std::int16_t shift) {
    report(mEvents.ColumnMouseDown, row, button, shift);
}

void TabuletAdapter::entryMoved(int row, std::int16_t buttons, std::int16_t shift) {
    DragSession& drags = mDrags;
    report(mEvents.ColumnMouseMove, row, buttons, shift);
    drags.runRequested();
}

void TabuletAdapter::entryReleased(int row, std::int16_t button, std::int16_t shift) {
    report(mEvents.ColumnMouseUp, row, button, shift);
}

void TabuletAdapter::entryDoubleClicked(int row) {
    mSurroundings.comforts.entryDoubleClicked(mIndex, row + 1);
}

void TabuletAdapter::menuKey(int row, QPoint at) {
    mSurroundings.menu.openAt(at, [&] { entryReleased(row, buttonState(Qt::RightButton), 0); });
}

void TabuletAdapter::deleteKey(int row) {
    mSurroundings.menu.choose(menuentry::deleteTable,
                              [&] { entryReleased(row, buttonState(Qt::RightButton), 0); });
}

void TabuletAdapter::selectionChanged() {
    if (mEvents.SelectionChanged) mEvents.SelectionChanged(mIndex);
}

void TabuletAdapter::listScrolled() {
    if (mEvents.Scroll) mEvents.Scroll(mIndex);
}

void TabuletAdapter::listMade(ColumnListView& list) {
    mFocus.watch(&list, [this] {
        if (mEvents.GotFocus) mEvents.GotFocus(mIndex);
    });
}

void TabuletAdapter::closeClicked() {
    if (mEvents.CloseClick) mEvents.CloseClick(mIndex);
}

// The edges are numbered alike.
static_assert(comforts::Edges(Qt::TopEdge) == comforts::topEdge &&
              comforts::Edges(Qt::LeftEdge) == comforts::leftEdge &&
              comforts::Edges(Qt::RightEdge) == comforts::rightEdge &&
              comforts::Edges(Qt::BottomEdge) == comforts::bottomEdge);

void TabuletAdapter::gestureBegan() { mGesture.begin(bounds()); }

void TabuletAdapter::gestureMoved(Qt::Edges edges, QPointF way) {
    if (!mWidget) return;
    const QSize smallest = mWidget->smallest();
    const Bounds box = mGesture.at(edges.toInt(), toTwips(way.x()), toTwips(way.y()),
                                   toTwips(smallest.width()), toTwips(smallest.height()));
    if (box == bounds()) return;
    setBounds(box);
    if (mEvents.Moving) mEvents.Moving(mIndex);
}

void TabuletAdapter::gestureEnded(Qt::Edges edges) {
    mGesture.end(edges.toInt(), *this, mEvents, mIndex,
                 [alive = mWidget] { return alive && alive->property(controlProperty).isValid(); });
}

void TabuletAdapter::gestureTakenBack() {
    setBounds(mGesture.start());
    if (mEvents.Moving) mEvents.Moving(mIndex);
}

bool TabuletAdapter::draggedOver(const QMimeData* data, QPointF at, std::int16_t state) {
    constexpr std::int16_t entering = 0;
    constexpr std::int16_t leaving = 1;
    if (data ? !mDrags.accepts(data) : !mDrags.source()) return false;
    if (state == entering) mSurroundings.comforts.dragCame(mIndex);
    mEntryTaken = false;
    const QPointer<TabuletWidget> alive = mWidget;
    if (mEvents.DragOver)
        mEvents.DragOver(mIndex, mDrags.source(), toTwips(at.x()), toTwips(at.y()), state);
    // The control answers by selecting the entry under the mouse if it can be dropped on. The drop
    // goes to the control either way; the cursor tells the user beforehand.
    if (!alive || !alive->property(controlProperty).isValid()) return true;
    mDrags.showWhetherDropCounts(state == leaving || mEntryTaken);
    if (state == leaving) mSurroundings.comforts.dragGone();
    return true;
}

bool TabuletAdapter::dropped(const QMimeData* data, QPointF at) {
    if (!mDrags.accepts(data)) return false;
    // The comforts outlive the table, which may be gone once the host has heard of the drop.
    auto& comforts = mSurroundings.comforts;
    mDrags.drop([this, &comforts, alive = mWidget, at, taken = mEntryTaken](bool counts) {
        if (!alive) return;
        if (counts && alive->property(controlProperty).isValid() && mEvents.DragDrop)
            mEvents.DragDrop(mIndex, mDrags.source(), toTwips(at.x()), toTwips(at.y()));
        if (alive) (counts && taken) ? comforts.dragTaken() : comforts.dragGone();
    });
    return true;
}

} // namespace zandor::platform::qt

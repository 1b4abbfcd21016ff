#include <Zandor/headless/Tabulet.h>

#include <Zandor/headless/Toolkit.h>

#include <algorithm>
#include <atomic>
#include <cmath>

namespace zandor::platform::headless {

namespace {

std::int32_t newHandle() {
    static std::atomic<std::int32_t> last = 0;
    return ++last;
}

} // namespace

ColumnItem::ColumnItem(Tabulet& table, std::int32_t position, String key, String text)
    : mTable(&table), mPosition(position), mKey(std::move(key)), mText(std::move(text)) {}

void ColumnItem::called(const char* member) const {
    if (mTable) mTable->called(member);
}

Tabulet& ColumnItem::table() const {
    if (!mTable) throw errors::objectNotSet();
    return *mTable;
}

const String& ColumnItem::Text() const {
    called("ColumnItem.Text");
    return mText;
}

const String& ColumnItem::Key() const {
    called("ColumnItem.Key");
    return mKey;
}

bool ColumnItem::Selected() const {
    called("ColumnItem.Selected");
    return mSelected;
}

void ColumnItem::Selected(bool value) {
    called("ColumnItem.Selected=");
    mSelected = value;
}

void ColumnItem::Image(std::int16_t value) {
    called("ColumnItem.Image");
    mImage = value;
    mPicture = mTable && mTable->mImages ? mTable->mImages->Image(value) : std::nullopt;
}

void ColumnItem::ComesOut(bool value) {
    called("ColumnItem.ComesOut");
    mComesOut = value;
}

void ColumnItem::Refresh() {
    called("ColumnItem.Refresh");
    draw();
}

void ColumnItem::EnsureVisible() {
    called("ColumnItem.EnsureVisible");
    Tabulet& list = table();
    if (list.inView(mPosition)) return;
    const bool above = mPosition < list.firstVisible();
    list.scrollTo(above ? mPosition : mPosition - std::max(1, list.rowsInView()) + 1);
}

TalvikTabulet::Point ColumnItem::LeftEdgePoint() const {
    called("ColumnItem.LeftEdgePoint");
    return edgePoint(0);
}

TalvikTabulet::Point ColumnItem::RightEdgePoint() const {
    called("ColumnItem.RightEdgePoint");
    return edgePoint(1);
}

TalvikTabulet::Point ColumnItem::edgePoint(float widths) const {
    const Bounds& at = table().placement();
    return {at.Left + widths * at.Width, at.Top + table().rowMiddle(mPosition)};
}

void ColumnItem::select(bool value) {
    mSelected = value;
    draw();
}

Tabulet::Tabulet(Toolkit& toolkit, const Design& design, Element* container, std::int16_t index,
                 const TalvikTabulet::TabuletEvents& events)
    : Placed(toolkit, design, container), index(index), events(events), mHandle(newHandle()) {
    setVisible(false);
}

Tabulet::~Tabulet() {
    dropEntries();
    mToolkit.endDragOf(this);
}

const String& Tabulet::Text() const {
    called("Text");
    return mLook.text;
}

void Tabulet::Text(const String& value) {
    called("Text=");
    mLook.text = value;
}

const String& Tabulet::Tag() const {
    called("Tag");
    return mTag;
}

void Tabulet::Tag(const String& value) {
    called("Tag=");
    mTag = value;
}

bool Tabulet::Visible() const {
    called("Visible");
    return mLook.visible;
}

void Tabulet::Visible(bool value) {
    called("Visible=");
    setVisible(value);
}

void Tabulet::Activated(bool value) {
    called("Activated");
    mActivated = value;
}

void Tabulet::Locked(bool value) {
    called("Locked");
    mLocked = value;
    if (!value || !mGrasped) return;
    place(*std::exchange(mGrasped, std::nullopt));
    if (events.Moving) events.Moving(index);
}

void Tabulet::Font(const platform::Font& value) {
    called("Font");
    mLook.font = value;
}

void Tabulet::Images(const Ref<platform::ImageList>& value) {
    called("Images");
    mImages = value;
}

void Tabulet::takeLookOf(const Tabulet& pattern) {
    mLook.font = pattern.mLook.font;
    mImages = pattern.mImages;
    mLocked = pattern.mLocked;
}

std::int32_t Tabulet::TableHandle() const {
    called("TableHandle");
    return mHandle;
}

TalvikTabulet::ColumnList& Tabulet::ColumnItems() {
    called("ColumnItems");
    return *this;
}

Ref<TalvikTabulet::ColumnItem> Tabulet::ColumnAt(float X, float Y) const {
    called("ColumnAt");
    const float down = Y - tabuletTitleHeight;
    const bool inList =
        X >= 0 && X < placement().Width && down >= 0 && Y < placement().Height - tabuletBorder;
    if (!inList) return {};
    const float row = std::floor(down / tabuletRowHeight) + static_cast<float>(mFirstVisible - 1);
    if (row >= static_cast<float>(mItems.size())) return {};
    return mItems[static_cast<std::size_t>(row)];
}

void Tabulet::ZOrder() {
    called("ZOrder");
    bringToFront();
}

void Tabulet::SetFocus() {
    called("SetFocus");
    takeFocus();
}

void Tabulet::Drag(std::int16_t action) {
    called("Drag");
    if (action == 1) {
        mToolkit.beginDrag(*this);
    } else if (action != 0) {
        throw errors::invalidProcedureCall();
    } else if (mToolkit.dragged() == this) {
        mToolkit.endDragOf(this);
        mToolkit.comforts.dragGone();
    }
}

void Tabulet::Complete() {
    called("Complete");
    for (std::int32_t i = 1; i <= static_cast<std::int32_t>(mItems.size()); ++i) entry(i).draw();
    ++mCompletions;
}

void Tabulet::Terminate() {
    called("Terminate");
    dropEntries();
}

void Tabulet::Unload() {
    called("Unload");
    dropEntries();
    mToolkit.endDragOf(this);
    leave();
}

void Tabulet::drag(const Bounds& bounds) {
    if (!mGrasped) return;
    place(bounds);
    if (events.Moving) events.Moving(index);
}

ColumnItem& Tabulet::entry(std::int32_t position) const {
    if (position < 1 || position > static_cast<std::int32_t>(mItems.size()))
        throw errors::subscriptOutOfRange();
    return static_cast<ColumnItem&>(*mItems[static_cast<std::size_t>(position) - 1]);
}

bool Tabulet::inView(std::int32_t position) const {
    return position >= mFirstVisible &&
           position < mFirstVisible + std::max<std::int32_t>(1, rowsInView());
}

std::int32_t Tabulet::rowsInView() const {
    const float list = placement().Height - tabuletTitleHeight - tabuletBorder;
    return static_cast<std::int32_t>(std::floor(std::max(0.0F, list) / tabuletRowHeight));
}

float Tabulet::rowMiddle(std::int32_t position) const {
    return tabuletTitleHeight +
           tabuletRowHeight * (static_cast<float>(position - mFirstVisible) + 0.5F);
}

TalvikTabulet::Point Tabulet::emptyPlace() const {
    const auto below = static_cast<std::int32_t>(mItems.size()) + 1;
    const float Y = rowMiddle(below);
    if (Y >= placement().Height - tabuletBorder) throw errors::invalidProcedureCall();
    return {placement().Width / 2, Y};
}

void Tabulet::scrollTo(std::int32_t position) {
    const auto last = std::max<std::int32_t>(1, static_cast<std::int32_t>(mItems.size()));
    const std::int32_t first = std::clamp<std::int32_t>(position, 1, last);
    if (first == mFirstVisible) return;
    mFirstVisible = first;
    if (events.Scroll) events.Scroll(index);
}

std::int32_t Tabulet::Count() const {
    called("ColumnItems.Count");
    return static_cast<std::int32_t>(mItems.size());
}

Ref<TalvikTabulet::ColumnItem> Tabulet::Item(std::int32_t position) const {
    called("ColumnItems.Item");
    entry(position);
    return mItems[static_cast<std::size_t>(position) - 1];
}

// Both pass where the longer way passes, so that they can be made to fail there.
bool Tabulet::Reads(std::int32_t position, StringView text) const {
    called("ColumnItems.Item");
    return entry(position).Text() == text;
}

bool Tabulet::IsAt(std::int32_t position, const TalvikTabulet::ColumnItem& item) const {
    called("ColumnItems.Item");
    return &entry(position) == &item;
}

Ref<TalvikTabulet::ColumnItem> Tabulet::Add(const String& key, const String& text) {
    called("ColumnItems.Add");
    const auto position = static_cast<std::int32_t>(mItems.size()) + 1;
    return mItems.emplace_back(makeRef<ColumnItem>(*this, position, key, text));
}

void Tabulet::gotFocus() {
    if (events.GotFocus) events.GotFocus(index);
}

void Tabulet::dropEntries() {
    for (std::int32_t i = 1; i <= static_cast<std::int32_t>(mItems.size()); ++i) entry(i).drop();
    mItems.clear();
    mFirstVisible = 1;
}

} // namespace zandor::platform::headless

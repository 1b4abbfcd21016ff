#pragma once

#include <Zandor/headless/Element.h>
#include <Zandor/headless/export.h>
#include <Zandor/platform/Tabulet.h>

#include <optional>
#include <utility>

namespace zandor::platform::headless {

class Tabulet;

inline constexpr float tabuletTitleHeight = 300;
inline constexpr float tabuletBorder = 45;
inline constexpr float tabuletRowHeight = 225;

class ZANDOR_HEADLESS_EXPORT ColumnItem final : public TalvikTabulet::ColumnItem {
public:
    ColumnItem(Tabulet& table, std::int32_t position, String key, String text);
    const String& Text() const override;
    const String& Key() const override;
    bool Selected() const override;
    void Selected(bool value) override;
    void Image(std::int16_t value) override;
    void ComesOut(bool value) override;
    void Refresh() override;
    void EnsureVisible() override;
    /// Error 91 for an entry that its list has dropped.
    TalvikTabulet::Point LeftEdgePoint() const override;
    TalvikTabulet::Point RightEdgePoint() const override;

    const String& text() const { return mText; }
    std::int16_t image() const { return mImage; }
    /// What stands beside the text.
    std::optional<Picture> picture() const { return mPicture; }
    bool comesOut() const { return mComesOut; }
    bool selected() const { return mSelected; }
    /// What the list shows: the selection as it was when the entry was last drawn.
    bool drawnSelected() const { return mDrawnSelected; }
    void draw() { mDrawnSelected = mSelected; }
    void select(bool value);
    void drop() { mTable = nullptr; }

private:
    void called(const char* member) const;
    Tabulet& table() const;
    TalvikTabulet::Point edgePoint(float widths) const;

    Tabulet* mTable;
    std::int32_t mPosition;
    String mKey;
    String mText;
    std::int16_t mImage = 0;
    std::optional<Picture> mPicture;
    bool mComesOut = false;
    bool mSelected = false;
    bool mDrawnSelected = false;
};

class ZANDOR_HEADLESS_EXPORT Tabulet final : public Placed<TalvikTabulet::Tabulet>,
                                             private TalvikTabulet::ColumnList {
public:
    Tabulet(Toolkit& toolkit, const Design& design, Element* container, std::int16_t index,
            const TalvikTabulet::TabuletEvents& events);
    ~Tabulet() override;

    const String& Text() const override;
    void Text(const String& value) override;
    const String& Tag() const override;
    void Tag(const String& value) override;
    bool Visible() const override;
    void Visible(bool value) override;
    void Activated(bool value) override;
    void Locked(bool value) override;
    void Font(const platform::Font& value) override;
    void Images(const Ref<platform::ImageList>& value) override;
    std::int32_t TableHandle() const override;
    TalvikTabulet::ColumnList& ColumnItems() override;
    Ref<TalvikTabulet::ColumnItem> ColumnAt(float X, float Y) const override;
    void ZOrder() override;
    void SetFocus() override;
    void Drag(std::int16_t action) override;
    void Complete() override;
    void Terminate() override;
    void Unload() override;

    const std::vector<Ref<TalvikTabulet::ColumnItem>>& entries() const { return mItems; }
    /// Error 9 outside 1 to the number of entries.
    ColumnItem& entry(std::int32_t position) const;
    const String& tag() const { return mTag; }
    bool activated() const { return mActivated; }
    bool locked() const { return mLocked; }
    /// How often the list was completed.
    int completions() const { return mCompletions; }

    std::int32_t firstVisible() const { return mFirstVisible; }
    bool inView(std::int32_t position) const;
    /// The middle of an entry's row in the list's own coordinates, wherever it is scrolled to.
    float rowMiddle(std::int32_t position) const;
    /// A point of the list below its last entry, in its own coordinates; error 5 when it is full.
    TalvikTabulet::Point emptyPlace() const;
    /// Makes an entry the first visible row. Scroll fires when that changes anything.
    void scrollTo(std::int32_t position);
    /// Its font, its images and its lock.
    void takeLookOf(const Tabulet& pattern);
    /// The user takes hold of it, to move or resize it by the mouse, and lets go; false when it was
    /// taken back meanwhile.
    void grasp() { mGrasped = placement(); }
    bool letGo() { return std::exchange(mGrasped, std::nullopt).has_value(); }
    /// As the user, who holds it, has it with the mouse; nothing once it was taken back.
    void drag(const Bounds& bounds);

    const std::int16_t index;
    const TalvikTabulet::TabuletEvents& events;

private:
    friend class ColumnItem;

    std::int32_t Count() const override;
    Ref<TalvikTabulet::ColumnItem> Item(std::int32_t position) const override;
    bool Reads(std::int32_t position, StringView text) const override;
    bool IsAt(std::int32_t position, const TalvikTabulet::ColumnItem& item) const override;
    Ref<TalvikTabulet::ColumnItem> Add(const String& key, const String& text) override;
    void gotFocus() override;
    void dropEntries();
    std::int32_t rowsInView() const;

    const std::int32_t mHandle;
    String mTag;
    bool mActivated = false;
    bool mLocked = false;
    int mCompletions = 0;
    std::optional<Bounds> mGrasped; ///< where it was when the user took hold of it
    Ref<platform::ImageList> mImages;
    std::int32_t mFirstVisible = 1;
    std::vector<Ref<TalvikTabulet::ColumnItem>> mItems;
};

} // namespace zandor::platform::headless

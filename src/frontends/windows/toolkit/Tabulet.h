#pragma once

#include "frontends/windows/toolkit/TableWindow.h"

#include <Zandor/platform/Tabulet.h>

#include <vector>

namespace zandor::platform::windows {

/// A table list of the control over its box.
class Tabulet final : public Constituent<TalvikTabulet::Tabulet, TableWindow>,
                      private TableListener,
                      private TalvikTabulet::ColumnList {
public:
    Tabulet(std::shared_ptr<TableWindow> window, std::int16_t index,
            const TalvikTabulet::TabuletEvents& events);
    ~Tabulet() override;

    /// Its font, its images and its lock.
    void takeLookOf(const Tabulet& pattern);

    const String& Text() const override { return mText; }
    void Text(const String& value) override;
    const String& Tag() const override { return mTag; }
    void Tag(const String& value) override { mTag = value; }
    bool Visible() const override { return mVisible; }
    void Visible(bool value) override;
    void Activated(bool value) override;
    void Locked(bool value) override { mWindow->setLocked(value); }
    void Font(const platform::Font& value) override { setFont(value); }
    void Images(const Ref<platform::ImageList>& value) override { mImages = value; }
    std::int32_t TableHandle() const override { return mHandle; }
    TalvikTabulet::ColumnList& ColumnItems() override { return *this; }
    Ref<TalvikTabulet::ColumnItem> ColumnAt(float X, float Y) const override;
    void ZOrder() override { mWindow->raise(); }
    void SetFocus() override { surroundings().focus.take(&mWindow->list()); }
    void Drag(std::int16_t action) override;
    void Complete() override;
    void Terminate() override { dropEntries(); }
    void Unload() override;

private:
    class Entry;

    std::int32_t Count() const override { return static_cast<std::int32_t>(mEntries.size()); }
    Ref<TalvikTabulet::ColumnItem> Item(std::int32_t position) const override;
    Ref<TalvikTabulet::ColumnItem> Add(const String& key, const String& text) override;
    std::vector<Ref<TalvikTabulet::ColumnItem>> Selected() const override;

    void entryPressed(int row, std::int16_t button, std::int16_t shift) override;
    void entryMoved(int row, std::int16_t buttons, std::int16_t shift) override;
    void entryReleased(int row, std::int16_t button, std::int16_t shift) override;
    void entryDoubleClicked(int row) override;
    void selectionChanged() override;
    void listScrolled() override;
    void listGotFocus() override;
    void menuKey(int row, POINT at) override;
    void deleteKey(int row) override;
    EntryLook lookOf(int row) const override;
    void closeClicked() override;
    void titleClicked() override;
    void gestureBegan() override { mGesture.begin(bounds()); }
    void gestureMoved(unsigned edges, POINT way) override;
    void gestureEnded(unsigned edges) override;
    void gestureTakenBack() override;
    bool draggedOver(POINT at, DragState state) override;
    void dropped(POINT at) override;

    void report(const TalvikTabulet::TabuletEvents::Mouse& handler, int row, std::int16_t button,
                std::int16_t shift);
    void dropEntries();

    const std::int16_t mIndex;
    const std::int32_t mHandle;
    const TalvikTabulet::TabuletEvents& mEvents;
    std::vector<Ref<Entry>> mEntries;
    String mText;
    String mTag;
    Ref<platform::ImageList> mImages;
    bool mVisible = false;
    bool mEntryTaken = false; ///< the control has selected an entry
    comforts::BoxGesture mGesture;
};

} // namespace zandor::platform::windows

#pragma once

#include "frontends/qt/Adapter.h"
#include "frontends/qt/EntryTexts.h"
#include "frontends/qt/LineEnds.h"
#include "frontends/qt/TabuletWidget.h"

#include <Zandor/comforts/BoxGesture.h>
#include <Zandor/comforts/Comforts.h>
#include <Zandor/platform/Tabulet.h>

#include <unordered_map>
#include <vector>

namespace zandor::platform::qt {

class DragSession;
class KeyboardMenu;
class TabuletAdapter;

/// What the table lists of one control share.
struct TabuletSurroundings {
    DragSession& drags;
    KeyboardMenu& menu;
    LineEnds& asked; ///< told when an entry is asked for an edge
    comforts::Comforts& comforts;
    TabuletAdapter* current = nullptr; ///< the activated one
};

class TabuletAdapter final : public Adapter<TalvikTabulet::Tabulet, TabuletWidget>,
                             private TabuletListener {
public:
    TabuletAdapter(TabuletWidget* widget, FocusTracker& focus, TabuletSurroundings& surroundings,
                   std::int16_t index, const TalvikTabulet::TabuletEvents& events);
    ~TabuletAdapter() override;

    const String& Text() const override { return mText; }
    void Text(const String& value) override;
    const String& Tag() const override { return mTag; }
    void Tag(const String& value) override { mTag = value; }
    bool Visible() const override { return mVisible; }
    void Visible(bool value) override;
    void Activated(bool value) override;
    void Locked(bool value) override;
    void Font(const platform::Font& value) override;
    void Images(const Ref<ImageList>& value) override { mImages = value; }
    const Ref<ImageList>& images() const { return mImages; }
    bool isLocked() const { return mWidget && mWidget->isLocked(); }
    std::int32_t TableHandle() const override { return mHandle; }
    TalvikTabulet::ColumnList& ColumnItems() override { return mEntries; }
    Ref<TalvikTabulet::ColumnItem> ColumnAt(float X, float Y) const override;
    void ZOrder() override;
    void SetFocus() override { mFocus.take(mWidget ? &mWidget->list() : nullptr); }
    void Drag(std::int16_t action) override;
    void Complete() override;
    void Terminate() override;
    void Unload() override;

private:
    class Entry;
    class Entries final : public TalvikTabulet::ColumnList {
    public:
        Entries(TabuletAdapter& table, std::shared_ptr<EntryTexts> texts)
            : mTable(table), mTexts(std::move(texts)) {}
        std::int32_t Count() const override { return mTexts->count(); }
        Ref<TalvikTabulet::ColumnItem> Item(std::int32_t position) const override;
        bool Reads(std::int32_t position, StringView text) const override;
        bool IsAt(std::int32_t position, const TalvikTabulet::ColumnItem& entry) const override;
        Ref<TalvikTabulet::ColumnItem> Add(const String& key, const String& text) override;
        std::vector<Ref<TalvikTabulet::ColumnItem>> Selected() const override;

        const EntryTexts& texts() const { return *mTexts; }
        void forget(int row) { mHeld.erase(row); }
        void dropAll();

    private:
        int rowOf(std::int32_t position) const;

        TabuletAdapter& mTable;
        const std::shared_ptr<EntryTexts> mTexts;
        mutable std::unordered_map<int, Entry*> mHeld; ///< by row; they say themselves when they go
    };

    void entryPressed(int row, std::int16_t button, std::int16_t shift) override;
    void entryMoved(int row, std::int16_t buttons, std::int16_t shift) override;
    void entryReleased(int row, std::int16_t button, std::int16_t shift) override;
    void entryDoubleClicked(int row) override;
    void selectionChanged() override;
    void listScrolled() override;
    void menuKey(int row, QPoint at) override;
    void deleteKey(int row) override;
    void listMade(ColumnListView& list) override;
    void closeClicked() override;
    void titleClicked() override { mSurroundings.comforts.titleClicked(mIndex); }
    void gestureBegan() override;
    void gestureMoved(Qt::Edges edges, QPointF way) override;
    void gestureEnded(Qt::Edges edges) override;
    void gestureTakenBack() override;
    bool draggedOver(const QMimeData* data, QPointF at, std::int16_t state) override;
    bool dropped(const QMimeData* data, QPointF at) override;
    void leave();
    void report(const TalvikTabulet::TabuletEvents::Mouse& handler, int row, std::int16_t button,
                std::int16_t shift);

    TabuletSurroundings& mSurroundings;
    DragSession& mDrags;
    const std::int16_t mIndex;
    const std::int32_t mHandle;
    const TalvikTabulet::TabuletEvents& mEvents;
    Entries mEntries;
    String mText;
    String mTag;
    Ref<ImageList> mImages;
    bool mVisible = false;
    bool mEntryTaken = false; ///< the control has selected an entry
    comforts::BoxGesture mGesture;
};

} // namespace zandor::platform::qt

#pragma once

#include <Zandor/platform/Control.h>
#include <Zandor/platform/ImageList.h>
#include <Zandor/platform/Ref.h>
#include <Zandor/platform/export.h>

#include <functional>
#include <vector>

/// The table-list control: a frame with a title bar, a close button and a scrollable list of
/// columns, which the user moves by its title and resizes by its border.
namespace TalvikTabulet {

namespace platform = zandor::platform;

using platform::Ref;
using platform::String;

/// A place on the canvas, in twips.
struct Point {
    float X = 0; ///< from its left edge
    float Y = 0; ///< from its upper edge
};

/// One entry of the list.
class ZANDOR_CONTROL_EXPORT ColumnItem {
public:
    virtual ~ColumnItem() = default;
    virtual const String& Text() const = 0; ///< what the entry shows
    /// The column's name is the entry's text.
    const String& ColumnItemName() const { return Text(); }
    virtual const String& Key() const = 0; ///< the model's
    /// Whether it is selected; shown after Refresh.
    virtual bool Selected() const = 0;
    virtual void Selected(bool value) = 0;
    /// The number of the image beside the text, from the list that the table list has then; 0, or
    /// one that the list has not: none. The control marks a column with 1.
    virtual void Image(std::int16_t value) = 0;
    /// Whether the column is shown as one that comes out in the query's rows.
    virtual void ComesOut(bool value) = 0;
    /// First follow-up of a changed selection: shows the entry as it now is.
    virtual void Refresh() = 0;
    /// Second follow-up: scrolls the list so that the entry is in view.
    virtual void EnsureVisible() = 0;
    /// On the left, respectively right, edge of the list at the middle of the entry's row, in
    /// canvas twips; also when the row is scrolled out of view.
    virtual Point LeftEdgePoint() const = 0;
    /// As LeftEdgePoint, on the right edge.
    virtual Point RightEdgePoint() const = 0;
};

/// The entries of a table list.
class ZANDOR_CONTROL_EXPORT ColumnList {
public:
    virtual ~ColumnList() = default;
    virtual std::int32_t Count() const = 0; ///< how many there are
    /// Position is 1-based; error 9 outside 1 to Count. A toolkit may make an entry when it is asked
    /// for: as long as somebody holds it, it is the same one.
    virtual Ref<ColumnItem> Item(std::int32_t position) const = 0;
    /// Whether the entry of a position shows a text. For this and the next the entry need not be
    /// made; errors as of Item.
    virtual bool Reads(std::int32_t position, platform::StringView text) const {
        return Item(position)->Text() == text;
    }
    /// Whether an entry that somebody holds is the one of a position.
    virtual bool IsAt(std::int32_t position, const ColumnItem& entry) const {
        return Item(position).get() == &entry;
    }
    virtual Ref<ColumnItem> Add(const String& key, const String& text) = 0; ///< behind the others
    /// The selected entries, in their order; asked one by one where the toolkit knows no better.
    virtual std::vector<Ref<ColumnItem>> Selected() const {
        std::vector<Ref<ColumnItem>> selected;
        for (std::int32_t n = 1; n <= Count(); ++n)
            if (const auto& entry = Item(n); entry->Selected()) selected.push_back(entry);
        return selected;
    }
};

/// A table list on the canvas.
class ZANDOR_CONTROL_EXPORT Tabulet : public platform::Control {
public:
    /// The default property: the table's display name in the title bar.
    virtual const String& Text() const = 0;
    virtual void Text(const String& value) = 0;
    /// A text that it bears, the model's key of its table.
    virtual const String& Tag() const = 0;
    virtual void Tag(const String& value) = 0;
    /// As set last.
    virtual bool Visible() const = 0;
    virtual void Visible(bool value) = 0;
    virtual void Activated(bool value) = 0; ///< whether it is shown as the current one
    /// Whether the user can neither move, nor resize, nor close it; nothing of that is offered
    /// then. A move or a resize that is going on is taken back: the table list is where it was,
    /// which Moving tells, and neither Moved nor Resized follows.
    virtual void Locked(bool value) = 0;
    virtual void Font(const platform::Font& value) = 0; ///< of title and entries
    /// What the images of its entries are taken from; it has none at first.
    virtual void Images(const Ref<platform::ImageList>& value) = 0;
    /// Unique among the live table lists of the process, never 0.
    virtual std::int32_t TableHandle() const = 0;
    virtual ColumnList& ColumnItems() = 0; ///< its entries
    /// The entry under a point in the table list's own coordinates (twips), or nothing.
    virtual Ref<ColumnItem> ColumnAt(float X, float Y) const = 0;
    virtual void ZOrder() = 0; ///< brings it before the others
    /// Error 5 when the control cannot take the focus now.
    virtual void SetFocus() = 0;
    /// 1 begins a drag with the table list as its source. 0 ends such a drag as Escape does, with
    /// nothing dropped; without one nothing happens.
    virtual void Drag(std::int16_t action) = 0;
    /// The list has been filled, or is to be shown afresh.
    virtual void Complete() = 0;
    /// Releases what the table list holds: its entries.
    virtual void Terminate() = 0;
    /// The element has been unloaded: the table list leaves the canvas for good and reports nothing
    /// more. Whoever still holds it, or one of its entries, can read its texts.
    virtual void Unload() = 0;
};

/// What a table list tells; every event carries the element's index first.
struct TabuletEvents {
    using Plain = std::function<void(std::int16_t Index)>; ///< with the element's index
    /// With the entry, or nothing beside them.
    using Mouse = std::function<void(std::int16_t Index, const Ref<ColumnItem>& Column,
                                     std::int16_t Button, std::int16_t Shift)>;

    Plain CloseClick;      ///< its close button was pressed
    Plain GotFocus;        ///< it has the focus now
    Mouse ColumnMouseDown; ///< a button goes down
    Mouse ColumnMouseMove; ///< the mouse moves; the entry is the one that was pressed
    Mouse ColumnMouseUp;   ///< a button comes up
    /// The user has changed the selection otherwise than by pressing an entry.
    Plain SelectionChanged;
    /// A drag is over it: State 0 comes, 1 goes, 2 moves on.
    std::function<void(std::int16_t Index, platform::Control* Source, float X, float Y,
                       std::int16_t State)>
        DragOver;
    /// A drag ends over it.
    std::function<void(std::int16_t Index, platform::Control* Source, float X, float Y)> DragDrop;
    /// While the user moves or resizes the table list; Moved or Resized follows at the end.
    Plain Moving;
    Plain Moved;   ///< the user has moved it
    Plain Resized; ///< the user has resized it
    Plain Scroll;  ///< its list shows other entries
};

} // namespace TalvikTabulet

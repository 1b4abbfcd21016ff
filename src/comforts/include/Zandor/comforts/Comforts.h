#pragma once

#include <Zandor/comforts/Field.h>
#include <Zandor/comforts/Flags.h>
#include <Zandor/control/Events.h>
#include <Zandor/control/Hooks.h>
#include <Zandor/platform/Tabulet.h>
#include <Zandor/platform/Toolkit.h>
#include <Zandor/platform/Words.h>
#include <Zandor/platform/export.h>

#include <map>
#include <memory>
#include <optional>
#include <utility>
#include <vector>

namespace TalvikDBxZandor {
class Zandor;
}

namespace zandor::comforts {

class Door;

/// What people expect of a query designer beyond the bare control, each comfort behind a flag.
///
/// A front end keeps one beside its toolkit, attached to the control for as long as there is one,
/// and forwards what its user does before the control hears of it. Each of these members answers
/// whether the comforts have dealt with it; what they have dealt with, the control is not told.
/// They act by the control's own procedures and events. Key codes and button and shift states are
/// those of the platform's events, places twips in the grid's coordinates.
///
/// No member throws. A failure is reported in a message box, as the control's own are. Each may
/// end with the control, and with the comforts themselves, when the host is told something.
class ZANDOR_CONTROL_EXPORT Comforts {
public:
    /// Name under which failures are reported.
    static constexpr platform::StringView ModuleName = u"comforts.Comforts";

    using String = platform::String; ///< UTF-16

    /// The toolkit outlives the comforts.
    explicit Comforts(platform::Toolkit& toolkit);
    Comforts(const Comforts&) = delete;
    Comforts& operator=(const Comforts&) = delete;
    ~Comforts();

    /// Begins to serve a control, which outlives this or is detached before.
    void attach(TalvikDBxZandor::Zandor& control);
    /// Lets go of it, with what stands open. Nothing happens without one.
    void detach();

    /// Which of them are on; new ones take effect at once.
    const Flags& flags() const { return mFlags; }
    void setFlags(const Flags& flags);
    /// What they say; new words are shown at once.
    const platform::Words& words() const { return mWords; }
    void setWords(const platform::Words& words);

    /// An event of the control, on its way to the host. False once the control has ended, as it may
    /// in a call of the model: the event has nowhere to go.
    bool raised(TalvikDBxZandor::Event event, const TalvikDBxZandor::EventArguments& arguments);

    // Entries of tables
    /// On an entry (1-based) of the table in a slot.
    bool entryDoubleClicked(std::int16_t table, std::int32_t entry);

    // Fields: the first cells of the grid's columns
    /// A press anywhere in the grid.
    bool gridPressed(std::int16_t button, float X, float Y);
    /// A click with the left button that was no drag.
    bool fieldClicked(std::int32_t column);
    /// Whether a blank column has anything to offer: with no table there is no field.
    bool hasFieldsToOffer() const;
    /// A key asks for the current cell's editor.
    bool cellOpened();

    // Columns of the grid
    /// Whether a drag of the column's field would move it.
    bool columnMovable(std::int32_t column);
    /// The user has moved a column to a position; both from 1.
    bool columnMoved(std::int32_t column, std::int32_t position);
    /// By a key: the current cell's column, by some places to the right.
    bool currentColumnMoved(std::int32_t step);
    /// The user has left a column's border so that it has this width.
    bool borderDragged(std::int32_t column, float width);
    /// The user wants the column to be as wide as what it holds.
    bool borderDoubleClicked(std::int32_t column);

    // Findings
    /// Marks the cells that they are about, and no others.
    void setFindings(std::vector<Finding> findings);
    /// Goes to a cell as a click on it does, without opening its editor. False when it is not in
    /// the grid.
    bool showCell(const String& definition, std::int32_t row);
    // Joins and tables
    /// A join in one sentence, with the words of the moment.
    String sentenceOf(const TalvikDBxZandor::PlacedJoin& join) const;
    /// A join as it is spoken, by its line (Spoken.h); empty for a line of none.
    String spokenName(const platform::Line& line);
    /// The right button has come up over the title of the table in a slot.
    bool titleClicked(std::int16_t table);
    /// The user wants another name for a table, by its key; set by the front end.
    std::function<void(const String& key)> RenameRequested;

    // Drags over tables
    /// A drag comes over the table in a slot; the control will select there what is dropped on.
    void dragCame(std::int16_t table);
    /// The drag has left the table or ended over it without a join, and the control has been told.
    void dragGone();
    /// It has ended over the table with what the control made of it.
    void dragTaken() { mUnderDrag.clear(); }

    // Editors of cells
    /// What is being typed goes into its cell, and the editor closes. For hosts that are about to
    /// use the query: before they run, save or close it.
    void takeOver();
    /// Writes what stands in the open text editor into the definition of the same key in another
    /// model; the editor and the control's own model stay as they are. Returns whether there was
    /// anything that is not in the model yet.
    bool writeTyping(const platform::Ref<TalvikZandorLib::Zandor>& copy);
    /// A printable text typed while the grid has the focus, for its current cell. An empty one is
    /// about to be composed by an input method: the editor that will have it opens with its value,
    /// but not a list, which has no use for a text before it is whole.
    bool cellTyped(const String& text);
    /// A key in an open editor. The caret counts as at an end of the text when nothing is selected
    /// and the key would not move it on; in a list it is at both.
    bool editorKey(std::int16_t keyCode, std::int16_t shift, bool atStart, bool atEnd);
    /// An item has been picked from the open editor's list, not only walked to.
    bool choiceMade();
    /// The focus has gone from the open editor to something else in the window.
    void editorLeft() { takeOver(); }

private:
    /// An open editor and the cell that it writes to, wherever the cell's column goes meanwhile.
    struct Typing {
        platform::Ref<TalvikZandorLib::Zandor> model;
        std::int32_t row = 0;
        std::int32_t column = 0;
        std::int32_t keyNumber = 0;
        String value; ///< as it was opened
    };

    /// The fields that the open list offers, and the column that is to get one.
    struct Offer {
        platform::Ref<TalvikZandorLib::Zandor> model;
        std::int32_t column = 0;
        std::int32_t keyNumber = 0; ///< 0: a blank column
        std::vector<Field> fields;
    };

    /// Runs the body with the door to the control; false without a control.
    bool act(platform::StringView procedure, const std::function<bool(Door&)>& body);

    void editorOpened(Door& door);
    void editorsClosing(Door& door);
    void laidOut(Door& door);
    void placeEditor(Door& door);
    void bound(Door& door);
    bool offerFields(Door& door, std::int32_t column, const String& typed);
    void fieldPicked(std::int32_t position);
    float fitting(Door& door, std::int32_t column) const;
    void fit(Door& door, std::int32_t column);
    void fitAll(Door& door);
    void resize(Door& door, std::int32_t column, std::int32_t width);
    void keep(std::int32_t keyNumber, std::int32_t width);
    void readWidths(Door& door);
    void markFindings(Door& door);
    static bool goOn(Door& door, std::int32_t rows, std::int32_t columns, bool edits);

    platform::LineNotes notesOf(const TalvikDBxZandor::PlacedJoin& join) const;
    void readJoins(bool now);
    void offerRename();
    void menuChecked(std::int16_t source);

    platform::Toolkit& mToolkit;
    Flags mFlags;
    platform::Words mWords;
    std::unique_ptr<platform::MenuEntry> mRename;
    std::shared_ptr<Door> mDoor;
    std::optional<Typing> mTyping;
    std::optional<Offer> mOffer;
    std::unique_ptr<platform::PickList> mFields; ///< made when it is first needed
    std::vector<Finding> mFindings;
    std::map<std::int32_t, float> mWidths; ///< set by hand, by key number
    /// The entries of the table under a drag, and whether each was selected.
    std::vector<std::pair<platform::Ref<TalvikTabulet::ColumnItem>, bool>> mUnderDrag;
};

} // namespace zandor::comforts

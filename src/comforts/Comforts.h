#pragma once

#include "comforts/Flags.h"
#include "platform/TalvikZandorLib.h"
#include "platform/Toolkit.h"

#include <memory>
#include <optional>

namespace TalvikDBxZandor {
class Zandor;
}

namespace comforts {

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
class Comforts {
public:
    static constexpr platform::StringView ModuleName = u"comforts.Comforts";

    using String = platform::String;

    /// The toolkit outlives the comforts.
    explicit Comforts(platform::Toolkit& toolkit);
    Comforts(const Comforts&) = delete;
    Comforts& operator=(const Comforts&) = delete;
    ~Comforts();

    void attach(TalvikDBxZandor::Zandor& control);
    void detach();

    const Flags& flags() const { return mFlags; }
    void setFlags(const Flags& flags) { mFlags = flags; }

    /// On an entry (1-based) of the table in a slot.
    bool entryDoubleClicked(std::int16_t table, std::int32_t entry);

    // Editors of cells
    /// What is being typed goes into its cell, and the editor closes. For hosts that are about to
    /// use the query: before they run, save or close it.
    void takeOver();
    /// A printable text typed while the grid has the focus, for its current cell.
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

    /// Runs the body with the door to the control; false without a control.
    bool act(platform::StringView procedure, const std::function<bool(Door&)>& body);

    void editorOpened(Door& door);
    void editorsClosing(Door& door);
    static bool goOn(Door& door, std::int32_t rows, std::int32_t columns, bool edits);

    platform::Toolkit& mToolkit;
    Flags mFlags;
    std::shared_ptr<Door> mDoor;
    std::optional<Typing> mTyping;
};

} // namespace comforts

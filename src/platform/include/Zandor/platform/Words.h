#pragma once

#include <Zandor/platform/String.h>

#include <iterator>
#include <utility>

namespace zandor::platform {

/// What is shown and spoken that no property of the control says, for a host to set or translate.
/// %1, %2 and %3 stand for names.
struct Words {
    // The cells of the grid and their editors
    String None = u"(None)";            ///< no sort order
    String Ascending = u"Ascending";    ///< a sort order
    String Descending = u"Descending";  ///< a sort order
    String Visible = u"Visible";        ///< an output column that comes out
    String NotVisible = u"Not Visible"; ///< as the editor sets it
    String Invisible = u"Invisible";    ///< as a bound definition shows it
    String Set = u"&Set";               ///< the editors' button

    // Joins
    String All = u"all"; ///< at the end of a line whose table keeps all its rows
    String Matching = u"the rows of %1 and %2 that match"; ///< an inner join in a sentence
    /// An outer join in a sentence.
    String AllOfOne = u"all rows of %1, and those of %2 that match";
    /// A full one in a sentence.
    String AllOfBoth = u"all rows of %1 and of %2, side by side where they match";
    String Join = u"Join %1 %2 %3"; ///< a line, spoken: a field, an operator, a field

    // Tables
    String Rename = u"Re&name…";              ///< the menu's entry
    String RemoveTable = u"Remove the table"; ///< a table's close button
    String KeyColumn = u"key column";         ///< an entry with the image of a key, spoken
    String ComesOut = u"comes out";           ///< one whose column comes out in the rows, spoken

    // Fields
    String AddField = u"Add field…";            ///< the head of the first blank column
    String FindField = u"Type to find a field"; ///< the empty box above the list of fields
    String Field = u"Field";                    ///< the box that they are found by, spoken
    String Fields = u"Fields";                  ///< that list, spoken
    String Column = u"column %1";               ///< one without a field, by its number, spoken

    // The parts of the control; all but the two tooltips are spoken only
    String Designer = u"Query designer";            ///< the whole control
    String Canvas = u"Tables and joins";            ///< the upper pane
    String Grid = u"Output columns";                ///< the lower pane
    String ScrollAcross = u"Scroll across";         ///< a scroll bar
    String ScrollDown = u"Scroll down";             ///< a scroll bar
    String Home = u"Back to the origin";            ///< a tooltip, too
    String Divider = u"Divider of canvas and grid"; ///< the handle between the panes
    String MoveDivider = u"Drag to give the canvas or the grid more room"; ///< a tooltip

    friend bool operator==(const Words&, const Words&) = default;
};

/// All of them by name.
inline constexpr std::pair<StringView, String Words::*> wordTable[] = {
    {u"None", &Words::None},
    {u"Ascending", &Words::Ascending},
    {u"Descending", &Words::Descending},
    {u"Visible", &Words::Visible},
    {u"NotVisible", &Words::NotVisible},
    {u"Invisible", &Words::Invisible},
    {u"Set", &Words::Set},
    {u"All", &Words::All},
    {u"Matching", &Words::Matching},
    {u"AllOfOne", &Words::AllOfOne},
    {u"AllOfBoth", &Words::AllOfBoth},
    {u"Join", &Words::Join},
    {u"Rename", &Words::Rename},
    {u"RemoveTable", &Words::RemoveTable},
    {u"KeyColumn", &Words::KeyColumn},
    {u"ComesOut", &Words::ComesOut},
    {u"AddField", &Words::AddField},
    {u"FindField", &Words::FindField},
    {u"Field", &Words::Field},
    {u"Fields", &Words::Fields},
    {u"Column", &Words::Column},
    {u"Designer", &Words::Designer},
    {u"Canvas", &Words::Canvas},
    {u"Grid", &Words::Grid},
    {u"ScrollAcross", &Words::ScrollAcross},
    {u"ScrollDown", &Words::ScrollDown},
    {u"Home", &Words::Home},
    {u"Divider", &Words::Divider},
    {u"MoveDivider", &Words::MoveDivider},
};
static_assert(sizeof(Words) == std::size(wordTable) * sizeof(String));

} // namespace zandor::platform

#include "frontends/qt/translatedWords.h"

#include <Zandor/ZandorWidget.h>
#include <Zandor/qt/Text.h>

namespace zandor::platform::qt {

Words translatedWords() {
    return {
        .None = fromQt(ZandorWidget::tr("(None)", "no sort order")),
        .Ascending = fromQt(ZandorWidget::tr("Ascending")),
        .Descending = fromQt(ZandorWidget::tr("Descending")),
        .Visible = fromQt(ZandorWidget::tr("Visible", "an output column")),
        .NotVisible = fromQt(ZandorWidget::tr("Not Visible")),
        .Invisible = fromQt(ZandorWidget::tr("Invisible")),
        .Set = fromQt(ZandorWidget::tr("&Set", "the button of a cell's editor")),
        .All = fromQt(ZandorWidget::tr("all", "the rows of a table, at the end of a line")),
        .Matching = fromQt(ZandorWidget::tr("the rows of %1 and %2 that match")),
        .AllOfOne = fromQt(ZandorWidget::tr("all rows of %1, and those of %2 that match")),
        .AllOfBoth =
            fromQt(ZandorWidget::tr("all rows of %1 and of %2, side by side where they match")),
        .Join = fromQt(ZandorWidget::tr("Join %1 %2 %3")),
        .Rename = fromQt(ZandorWidget::tr("Re&name…")),
        .RemoveTable = fromQt(ZandorWidget::tr("Remove the table")),
        .KeyColumn = fromQt(ZandorWidget::tr("key column", "an entry of a table")),
        .ComesOut = fromQt(ZandorWidget::tr("comes out", "an entry of a table, in the rows")),
        .AddField = fromQt(ZandorWidget::tr("Add field…")),
        .FindField = fromQt(ZandorWidget::tr("Type to find a field")),
        .Field = fromQt(ZandorWidget::tr("Field")),
        .Fields = fromQt(ZandorWidget::tr("Fields")),
        .Column = fromQt(ZandorWidget::tr("column %1")),
        .Designer = fromQt(ZandorWidget::tr("Query designer")),
        .Canvas = fromQt(ZandorWidget::tr("Tables and joins")),
        .Grid = fromQt(ZandorWidget::tr("Output columns")),
        .ScrollAcross = fromQt(ZandorWidget::tr("Scroll across")),
        .ScrollDown = fromQt(ZandorWidget::tr("Scroll down")),
        .Home = fromQt(ZandorWidget::tr("Back to the origin")),
        .Divider = fromQt(ZandorWidget::tr("Divider of canvas and grid")),
        .MoveDivider = fromQt(ZandorWidget::tr("Drag to give the canvas or the grid more room")),
    };
}

} // namespace zandor::platform::qt

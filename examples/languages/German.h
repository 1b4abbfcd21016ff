#pragma once

#include <Zandor/platform/Words.h>

#include <utility>

/// All that the designer says, in German. An ampersand stands before the letter that chooses an
/// entry or a button.
namespace german {

/// The texts that are properties of the widget.
inline constexpr std::pair<const char*, const char*> properties[] = {
    {"LNGJoinForm", "Verknüpfung"},
    {"LNGJoinLeftTable", "Linke Tabelle:"},
    {"LNGJoinLeftColumn", "Linke Spalte:"},
    {"LNGJoinRightTable", "Rechte Tabelle:"},
    {"LNGJoinRightColumn", "Rechte Spalte:"},
    {"LNGJoinType", "Art der Verknüpfung"},
    {"LNGJoinTypeNormal", "Nur passende Zeilen"},
    {"LNGJoinTypeLeftOuter", "Alle Zeilen links"},
    {"LNGJoinTypeRightOuter", "Alle Zeilen rechts"},
    {"LNGJoinTypeBothOuter", "Alle Zeilen beiderseits"},
    {"LNGJoinOk", "&Übernehmen"},
    {"LNGJoinCancel", "&Abbrechen"},
    {"LNGMnuShowJoinDef", "&Verknüpfung bearbeiten…"},
    {"LNGMnuDelJoin", "Verknüpfung &löschen"},
    {"LNGMnuCopyCol", "Spalte &kopieren"},
    {"LNGMnuCreateJoin", "&Mit kopierter Spalte verknüpfen"},
    {"LNGMnuDelTable", "&Tabelle entfernen"},
    {"LNGMnuPasteCol", "Spalte &einfügen"},
    {"LNGMnuDelCol", "Ausgabespalte l&öschen"},
    {"LNGSpreadField", "Feld:"},
    {"LNGSpreadSynonym", "Überschrift:"},
    {"LNGSpreadSort", "Sortierung:"},
    {"LNGSpreadVisible", "Ausgabe:"},
    {"LNGSpreadCriteria", "Kriterien:"},
    {"LNGSpreadOr", "oder:"},
};

/// What no property says.
inline zandor::platform::Words words() {
    return {
        .None = u"(keine)",
        .Ascending = u"Aufsteigend",
        .Descending = u"Absteigend",
        .Visible = u"Sichtbar",
        .NotVisible = u"Nicht sichtbar",
        .Invisible = u"Unsichtbar",
        .Set = u"Ü&bernehmen",
        .All = u"alle",
        .Matching = u"die Zeilen von %1 und %2, die zusammenpassen",
        .AllOfOne = u"alle Zeilen von %1 und die dazu passenden von %2",
        .AllOfBoth = u"alle Zeilen von %1 und %2, nebeneinander, wo sie zusammenpassen",
        .Join = u"Verknüpfung %1 %2 %3",
        .Rename = u"&Umbenennen…",
        .RemoveTable = u"Tabelle entfernen",
        .KeyColumn = u"Schlüsselspalte",
        .ComesOut = u"wird ausgegeben",
        .AddField = u"Feld hinzufügen…",
        .FindField = u"Zum Suchen tippen",
        .Field = u"Feld",
        .Fields = u"Felder",
        .Column = u"Spalte %1",
        .Designer = u"Abfrageentwurf",
        .Canvas = u"Tabellen und Verknüpfungen",
        .Grid = u"Ausgabespalten",
        .ScrollAcross = u"Waagerecht rollen",
        .ScrollDown = u"Senkrecht rollen",
        .Home = u"Zurück zum Anfang",
        .Divider = u"Grenze zwischen Zeichnung und Raster",
        .MoveDivider = u"Ziehen gibt der Zeichnung oder dem Raster mehr Platz",
    };
}

} // namespace german

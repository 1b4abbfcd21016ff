#pragma once

#include <Zandor/TalvikZandorLib.h>
#include <Zandor/control/Reached.h>
#include <Zandor/platform/Words.h>

#include <vector>

/// A query as a control shows it, read from the model in one go: every call of the model may run
/// the host's code, whatever that does. What was read can be compared with what is shown, and be
/// shown, without another call.
namespace TalvikDBxZandor {

struct EntryPicture {
    platform::String key;
    platform::String text;
    bool marked = false;
};

/// Placement as ZDTable has it.
struct TablePicture {
    platform::String key;
    platform::String name;
    std::int32_t left = 0;
    std::int32_t top = 0;
    std::int32_t width = 0;
    std::int32_t height = 0;
    bool selected = false;
    std::vector<EntryPicture> entries;

    bool isPlaced() const { return left >= 0 && top >= 0; }
    bool isSized() const { return width > 0 && height > 0; }
};

/// Tables by their keys, columns by their names.
struct JoinPicture {
    platform::String key;
    platform::String leftTable;
    platform::String leftColumn;
    platform::String rightTable;
    platform::String rightColumn;
    std::int16_t type = 0;
    std::int16_t comparison = 0;
};

struct DefinitionPicture {
    std::int32_t number = 0;             ///< of the key; 0 for a key of another form
    std::vector<platform::String> cells; ///< texts by the grid's rows
};

struct QueryPicture {
    std::vector<TablePicture> tables;
    std::vector<JoinPicture> joins;
    std::vector<DefinitionPicture> definitions;
};

/// Reads the first tables of a model, as many as are shown at most; the joins, but for those that
/// no line can show, from a table to itself or with an end lost; and the first definitions, with
/// the texts of as many rows. An error of the model passes through; ends in quiet with the control.
QueryPicture pictureOf(const Life& life, const Held<TalvikZandorLib::Zandor>& model,
                       std::size_t tables, std::size_t definitions, std::size_t rows,
                       const platform::Words& words);

} // namespace TalvikDBxZandor

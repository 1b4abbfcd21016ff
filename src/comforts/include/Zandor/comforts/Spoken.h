#pragma once

#include <Zandor/platform/ImageList.h>
#include <Zandor/platform/Words.h>
#include <Zandor/platform/export.h>

#include <cstdint>
#include <functional>
#include <optional>

namespace TalvikDBxZandor {
class Zandor;
}

namespace zandor::comforts {

// What a front end says of the control's parts to people who do not see them.

/// Those that are spoken of entries, which there may be many lists of.
struct EntryWords {
    EntryWords() : EntryWords(platform::Words()) {} ///< in English
    /// Of a control's words.
    explicit EntryWords(const platform::Words& words)
        : KeyColumn(words.KeyColumn), ComesOut(words.ComesOut) {}

    platform::String KeyColumn; ///< as Words::KeyColumn
    platform::String ComesOut;  ///< as Words::ComesOut
};

/// Of an entry beside its text: "key column, comes out"; empty for one that is neither.
ZANDOR_CONTROL_EXPORT platform::String
spokenOfEntry(const EntryWords& words, std::optional<platform::Picture> picture, bool comesOut);

/// The text of a cell of the grid.
using CellText = std::function<platform::String(std::int32_t row, std::int32_t col)>;

/// A cell without its text, by its row's title and its column's field: "Sort, orders.id". A row
/// without a title goes on with the one above.
ZANDOR_CONTROL_EXPORT platform::String
titleOfCell(const platform::Words& words, const CellText& text, std::int32_t row, std::int32_t col);
/// The same with its text, where it has one: "Sort, orders.id: Ascending".
ZANDOR_CONTROL_EXPORT platform::String
nameOfCell(const platform::Words& words, const CellText& text, std::int32_t row, std::int32_t col);

/// An entry that a join line runs to: the keys of its table and its column, and "orders.id".
struct JoinSide {
    platform::String Table;  ///< the key of its table
    platform::String Column; ///< the key of its column
    platform::String Field;  ///< "orders.id"
};

/// A join: "Join orders.customer_id = customers.id, Left Outer". Sides, operator and type are the
/// model's; while the model does not know the join, or fails, the sides are those that the line
/// runs between, the western one first.
ZANDOR_CONTROL_EXPORT platform::String nameOfJoin(TalvikDBxZandor::Zandor& control,
                                                  const JoinSide& west, const JoinSide& east);

} // namespace zandor::comforts

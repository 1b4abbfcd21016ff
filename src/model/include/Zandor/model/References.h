#pragma once

#include <Zandor/model/Place.h>

#include <vector>

namespace zandor::model::criteria {

/// What the names at one place of a criterion's text were found to be when they were typed. Being
/// tied by key, the criterion stays with its table when that gets another name, and never slips to
/// another table of the old name. Positions count UTF-16 code units from 0.
struct Reference {
    std::size_t begin = 0;    ///< of the first name
    std::size_t tableEnd = 0; ///< behind the table's name; `begin` when the column stands alone
    ColumnPlace column{};     ///< empty: no column, so they are a text or a parameter

    /// Whether the table is named before the column.
    bool namesTable() const { return tableEnd > begin; }

    friend bool operator==(const Reference&, const Reference&) = default;
};

/// In the order of the text.
using References = std::vector<Reference>;

/// A criterion or an expression as it was typed, with what its names were found to be so far.
struct TiedText {
    String text = {};           ///< as it was typed
    References references = {}; ///< of its names

    friend bool operator==(const TiedText&, const TiedText&) = default;
};

} // namespace zandor::model::criteria

#include "model/sql/BareNames.h"

#include "model/sql/ReservedWords.h"

#include <algorithm>

namespace zandor::model::sql {

namespace {

enum class Case { small, capital, mixed };

struct Letters {
    char16_t first;
    char16_t last;
    Case which; ///< small also where the script has no capitals
};

// What all engines and versions agree about; combining marks and signs are none.
constexpr Letters letters[] = {
    {u'A', u'Z', Case::capital},     {u'a', u'z', Case::small},
    {0x00C0, 0x00D6, Case::capital}, {0x00D8, 0x00DE, Case::capital}, // Latin
    {0x00DF, 0x00F6, Case::small},   {0x00F8, 0x00FF, Case::small},
    {0x0100, 0x017F, Case::mixed},   {0x0391, 0x03A1, Case::capital}, // Greek
    {0x03A3, 0x03AB, Case::capital}, {0x03AC, 0x03CE, Case::small},
    {0x0400, 0x042F, Case::capital}, {0x0430, 0x045F, Case::small}, // Cyrillic
    {0x3041, 0x3096, Case::small},   {0x30A1, 0x30FA, Case::small}, // Japanese
    {0x4E00, 0x9FFF, Case::small},   {0xAC00, 0xD7A3, Case::small}, // Chinese, Korean
};

const Letters* lettersOf(char16_t c) {
    const auto* const found =
        std::find_if(std::begin(letters), std::end(letters),
                     [c](const Letters& range) { return range.first <= c && c <= range.last; });
    return found == std::end(letters) ? nullptr : found;
}

bool isDigit(char16_t c) { return c >= u'0' && c <= u'9'; }

/// Whether a letter is read as itself.
bool keeps(char16_t c, Dialect dialect) {
    const Letters* const range = lettersOf(c);
    if (!range) return false;
    // One folds names to small letters, those beyond Z only in some databases; the norm folds them
    // to capitals.
    if (dialect == Dialect::PostgreSQL) return range->which == Case::small;
    if (dialect == Dialect::Standard) return c >= u'A' && c <= u'Z';
    // Nobody has tried which other letters this one takes.
    if (dialect == Dialect::SqlServer) return c < 0x80;
    return true;
}

} // namespace

bool isLetter(char16_t c) { return lettersOf(c) != nullptr; }

bool isBare(StringView name, Dialect dialect) {
    const bool norm = dialect == Dialect::Standard;
    const auto starts = [&](char16_t c) { return keeps(c, dialect) || (c == u'_' && !norm); };
    const auto follows = [&](char16_t c) {
        return keeps(c, dialect) || isDigit(c) || c == u'_' || (c == u'$' && !norm);
    };
    return !name.empty() && starts(name.front()) &&
           std::all_of(name.begin(), name.end(), follows) && !isReserved(name, dialect);
}

} // namespace zandor::model::sql

#pragma once

#include <Zandor/model/export.h>
#include <Zandor/sql/Dialect.h>

#include <span>

namespace zandor::model::sql {

/// The words that a dialect takes for its own where the name of a table, of a column or of what
/// comes out should stand, in small letters and in order.
ZANDOR_MODEL_EXPORT std::span<const StringView> reservedWords(Dialect dialect);

/// Whether a word is one of them, without regard to case.
ZANDOR_MODEL_EXPORT bool isReserved(StringView word, Dialect dialect);

} // namespace zandor::model::sql

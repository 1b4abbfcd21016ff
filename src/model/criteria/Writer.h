#pragma once

#include "model/criteria/Parser.h"

#include <Zandor/model/export.h>

/// The way back: trees as people would type them.
namespace zandor::model::criteria {

/// A pattern as sql::Like keeps it, as people type it behind Like.
ZANDOR_MODEL_EXPORT String typedPattern(StringView pattern);

/// An expression that reads as a tree again; nothing where the language has no words for a part of
/// it, as for totals.
ZANDOR_MODEL_EXPORT std::optional<String> written(const sql::Node& node);

/// The shortest criterion in a cell of `subject` that sets a condition again; nothing where there
/// is none. What the subject is not on the left of stands there with a left side of its own.
ZANDOR_MODEL_EXPORT std::optional<String> written(const sql::Node& condition,
                                                  const Subject& subject,
                                                  const Resolver& resolver);

} // namespace zandor::model::criteria

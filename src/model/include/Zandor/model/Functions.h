#pragma once

#include <Zandor/model/export.h>
#include <Zandor/platform/String.h>

#include <span>

namespace zandor::model::criteria {

/// A function that expressions know.
struct FunctionName {
    platform::StringView name;  ///< as it is written, in any case
    platform::StringView usage; ///< with what stands in its parentheses: "Left(text, characters)"
};

/// All of them, in the order of the page about criteria.
ZANDOR_MODEL_EXPORT std::span<const FunctionName> functions();

/// A name as criteria and expressions have it: in brackets where it is none without, a closing one
/// within doubled.
ZANDOR_MODEL_EXPORT platform::String writtenName(platform::StringView name);

} // namespace zandor::model::criteria

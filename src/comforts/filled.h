#pragma once

#include <Zandor/platform/String.h>

#include <initializer_list>

namespace zandor::comforts {

/// Puts names into the places %1, %2 and so on of a pattern; those that stand in a name stay as
/// they are.
inline platform::String filled(const platform::String& pattern,
                               std::initializer_list<platform::StringView> names) {
    platform::String text;
    for (std::size_t i = 0; i < pattern.size(); ++i) {
        const std::size_t place =
            pattern[i] == u'%' && i + 1 < pattern.size() ? std::size_t(pattern[i + 1]) - u'1' : 9;
        if (place >= names.size()) {
            text += pattern[i];
        } else {
            text += names.begin()[place];
            ++i;
        }
    }
    return text;
}

} // namespace zandor::comforts

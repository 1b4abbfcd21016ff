#pragma once

#include "platform/String.h"

namespace comforts {

/// What the comforts say of their own, for a host to set or translate. %1 and %2 stand for names.
struct Words {
    using String = platform::String;

    String All = u"all"; ///< at the end of a line whose table keeps all its rows
    String Matching = u"the rows of %1 and %2 that match";
    String AllOfOne = u"all rows of %1, and those of %2 that match";
    String AllOfBoth = u"all rows of %1 and of %2, side by side where they match";
    String Rename = u"Re&name…"; ///< the menu's entry
};

} // namespace comforts

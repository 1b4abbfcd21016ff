#pragma once

#include "platform/Words.h"

namespace platform::qt {

/// The words as the installed translators have them, in the context "ZandorWidget"; those that none
/// translates are the defaults.
Words translatedWords();

} // namespace platform::qt

#pragma once

#include <Zandor/platform/Words.h>

namespace zandor::platform::qt {

/// The words as the installed translators have them, in the context "ZandorWidget"; those that none
/// translates are the defaults.
Words translatedWords();

} // namespace zandor::platform::qt

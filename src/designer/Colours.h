#pragma once

namespace designer {

/// Gives the whole application dark colours, whatever the desktop uses.
void useDarkColours();

} // namespace designer

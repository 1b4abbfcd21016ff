#pragma once

namespace zandor::designer {

/// Gives the whole application dark colours, whatever the desktop uses.
void useDarkColours();

/// Gives it the desktop's own colours again.
void useOwnColours();

/// Whether useDarkColours() is in force.
bool areDarkColoursUsed();

/// Whether the application's colours of the moment are dark, by whomever.
bool areColoursDark();

} // namespace zandor::designer

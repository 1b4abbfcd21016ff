#pragma once

#include "Setting.h"

namespace report {

// One size of what grows, measured by the file that measures its figure.
double dragStep(const Setting& setting);   ///< us
double coreStep(const Setting& setting);   ///< us
double listScroll(const Setting& setting); ///< us
double press(const Setting& setting);      ///< us
double bind(const Setting& setting);       ///< ms

} // namespace report

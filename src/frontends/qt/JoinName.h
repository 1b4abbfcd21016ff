#pragma once

#include <QString>

namespace TalvikDBxZandor {
class Zandor;
}

namespace zandor::platform::qt {

struct LineEnds;

/// A join as it is spoken (comforts/Spoken.h); empty where an end of the line has gone.
QString joinName(TalvikDBxZandor::Zandor& control, const LineEnds& ends);

} // namespace zandor::platform::qt

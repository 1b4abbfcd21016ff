#pragma once

#include <QString>

namespace zandor::designer {

/// The sample database: beside the build that this program comes from, or else where it is
/// installed with it. The application exists.
QString placeOfSample();

} // namespace zandor::designer

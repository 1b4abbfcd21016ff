#pragma once

#include "model/files/Json.h"

#include <map>

namespace zandor::files {

/// Members of the file that this version does not know, by the object that they stand in: "" the
/// file itself, "typed", "lastKeys", then by keys "t1", "t1/source", "t1/place", "c1", "j1",
/// "j1/left", "j1/right", "x1", "x1/4" (the criterion of row 4). Those of a saved query stand
/// behind the table that it is: "t1/source/query/j1".
struct Unknown {
    std::map<std::string, json::Members> membersOf = {};
};

} // namespace zandor::files

#pragma once

#include <nlohmann/json.hpp>

#include <string>

namespace zandor::sql_reader {

/// The tree of what was read: {"stmts": [...]}. Throws Refused where it cannot be parsed.
nlohmann::json parse(const std::string& text);

} // namespace zandor::sql_reader

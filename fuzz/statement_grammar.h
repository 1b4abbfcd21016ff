#pragma once

#include <random>
#include <string>

/// Makes a SELECT in SQLite's own language, as people may write one, over the tables of the
/// fuzzer: most of them run, and compare what can be compared.
std::string randomStatement(std::minstd_rand& random);

#pragma once

#include <Zandor/Query.h>

#include <cstdint>

/// A query as a long session of a random user leaves it: tables, joins and definitions were added,
/// changed and deleted through the interface that the control uses. The same seed gives the same
/// query.
zandor::platform::Ref<zandor::model::Query> randomQuery(std::uint32_t seed);

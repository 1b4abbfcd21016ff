#pragma once

#include <Zandor/model/Total.h>

#include <QString>

#include <span>

namespace zandor::designer {

/// In the order in which they are offered, None first.
std::span<const model::Total> allTotals();

/// "&Sum", with a mnemonic; None is "&No total".
QString nameOf(model::Total total);

} // namespace zandor::designer

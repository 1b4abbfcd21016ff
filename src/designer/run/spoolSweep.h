#pragma once

#include <QString>

namespace zandor::designer {

/// Removes the spools that runs of the designer have left in a folder: files of this user that are
/// named as spools are and that no living process holds open. Where it cannot be told who holds
/// them, none is. Returns how many have gone.
int sweepSpools(const QString& folder);

/// In each folder that spools are made in.
void sweepSpools();

} // namespace zandor::designer

#pragma once

#include "designer/run/Cell.h"
#include "designer/run/Decimal.h"

#include <Zandor/model/Format.h>

namespace zandor::designer {

/// How the values of a column are shown.
struct CellFormat {
    model::Format format = model::Format::None;
    int decimals = model::asManyAsThereAre;

    friend bool operator==(const CellFormat&, const CellFormat&) = default;
};

/// A value of any kind but a blob as its reader writes it, in the user's language: without a format
/// a number has the decimal sign of the language, and no marks between thousands, for it may be a
/// year or the number of an invoice. What the format is not for is shown as without one.
QString shown(const Cell& cell, const CellFormat& format = {});

/// The same of a number, to its last digit.
QString shown(const Decimal& number, const CellFormat& format = {});

} // namespace zandor::designer

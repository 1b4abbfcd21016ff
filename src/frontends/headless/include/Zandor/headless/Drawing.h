#pragma once

#include <Zandor/TalvikZandorLib.h>
#include <Zandor/headless/export.h>

#include <string>

namespace zandor::platform::headless {

class Toolkit;

/// The drawing of a query as SVG, in UTF-8: its tables and joins, for a program that has neither a
/// window nor a toolkit, such as a server. One logical pixel (15 twips) is one unit. A table shows
/// as many of its columns as go into it, and says how many more there are; a query without tables
/// gives an empty picture. The texts are of the model: whatever they hold is escaped.
///
/// The query is shown by a control that lives as long as the call. It writes into the query the
/// places that it finds for tables without one, and which table and columns are selected; hand over
/// a copy where that matters. Throws a RuntimeError: 91 when there is no query, 440 with the
/// control's first report when the model fails.
ZANDOR_HEADLESS_EXPORT std::string svgOf(TalvikZandorLib::Library& library,
                                         const Ref<TalvikZandorLib::Zandor>& query);

/// The canvas of a control on this toolkit, as it is now: what is drawn, wherever it is scrolled
/// to. std::logic_error when there is no control on it.
ZANDOR_HEADLESS_EXPORT std::string svgOf(const Toolkit& toolkit);

} // namespace zandor::platform::headless

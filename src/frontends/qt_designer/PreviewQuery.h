#pragma once

#include <Zandor/Query.h>

namespace zandor::platform::qt_designer {

/// What the widget shows while a form is edited: tables, joins between them, output columns. Each
/// widget has one of its own, for in a preview of the form people change it.
Ref<model::Query> makePreviewQuery();

} // namespace zandor::platform::qt_designer

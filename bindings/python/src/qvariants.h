#pragma once

namespace zandor::python {

/// Has PyQt6 carry references to model objects in QVariants, as in the widget's property Zandor.
void registerQVariants();

} // namespace zandor::python

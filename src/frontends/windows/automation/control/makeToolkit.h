#pragma once

#include <Zandor/platform/Toolkit.h>

#include <memory>

namespace zandor::automation {

/// What a control that is made by automation is shown with.
std::unique_ptr<platform::Toolkit> makeToolkit();

} // namespace zandor::automation

#include "frontends/windows/automation/control/makeToolkit.h"

#include <Zandor/headless/Toolkit.h>

namespace zandor::automation {

std::unique_ptr<platform::Toolkit> makeToolkit() {
    return std::make_unique<platform::headless::Toolkit>();
}

} // namespace zandor::automation

#pragma once

#include "frontends/windows/automation/com/system.h"

#include <Zandor/Zandor.h>

namespace zandor::automation {

/// Calls a member of the public interface as a late-bound host does: by its dispatch id, with named
/// arguments too. What the control itself reports to its user is no failure here.
///
/// DISP_E_MEMBERNOTFOUND for what there is not, or not in this way; DISP_E_BADPARAMCOUNT,
/// DISP_E_PARAMNOTOPTIONAL, DISP_E_PARAMNOTFOUND; DISP_E_TYPEMISMATCH and DISP_E_OVERFLOW with the
/// place of the argument in `wrong`. Nothing is called then.
HRESULT invoke(TalvikDBxZandor::Zandor& control, DISPID member, WORD flags,
               const DISPPARAMS& arguments, VARIANT* result, EXCEPINFO* failure, UINT* wrong);

} // namespace zandor::automation

#include "frontends/windows/automation/model/CriteriumObject.h"

#include "frontends/windows/automation/model/members.h"

namespace zandor::automation {

STDMETHODIMP CriteriumObject::get_Criterium(BSTR* value) {
    return answer([&] { give(value, object()->Criterium()); });
}

STDMETHODIMP CriteriumObject::put_Criterium(BSTR value) {
    return answer([&] { object()->Criterium(textOf(value)); });
}

} // namespace zandor::automation

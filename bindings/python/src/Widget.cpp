#include "sipAPI_zandor.h"

#include "Host.h"
#include "Widget.h"

namespace zandor::python {

int Widget::visit(visitproc visit, void* argument) const {
    const auto* const base = reinterpret_cast<const sipClassTypeDef*>(sipType_QObject);
    if (base->ctd_traverse)
        if (const int result = base->ctd_traverse(const_cast<Widget*>(this), visit, argument))
            return result;
    for (const auto* host :
         {dynamic_cast<const Host*>(model().get()), dynamic_cast<const Host*>(mLibrary.get())})
        if (host)
            if (const int result = visit(host->object(), argument)) return result;
    return 0;
}

} // namespace zandor::python

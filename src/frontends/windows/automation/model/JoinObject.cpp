#include "frontends/windows/automation/model/JoinObject.h"

#include "frontends/windows/automation/model/OpenJoin.h"
#include "frontends/windows/automation/model/members.h"

namespace zandor::automation {

STDMETHODIMP JoinObject::get_Key(BSTR* value) {
    return answer([&] { give(value, object()->Key()); });
}

STDMETHODIMP JoinObject::put_Key(BSTR value) {
    return answer([&] {
        auto* const open = dynamic_cast<OpenJoin*>(object().get());
        // One of a query has its key for good.
        if (!open) throw platform::errors::unsupportedMember();
        open->Key(textOf(value));
    });
}

STDMETHODIMP JoinObject::get_LeftTable(IDispatch** value) {
    return answer([&] { give(value, object()->LeftTable()); });
}

STDMETHODIMP JoinObject::putref_LeftTable(IDispatch* value) {
    return answer([&] { object()->LeftTable(fromHost<TalvikZandorLib::ZDTable>(value)); });
}

STDMETHODIMP JoinObject::get_LeftColumn(IDispatch** value) {
    return answer([&] { give(value, object()->LeftColumn()); });
}

STDMETHODIMP JoinObject::putref_LeftColumn(IDispatch* value) {
    return answer([&] { object()->LeftColumn(fromHost<TalvikZandorLib::ZDColumn>(value)); });
}

STDMETHODIMP JoinObject::get_RightTable(IDispatch** value) {
    return answer([&] { give(value, object()->RightTable()); });
}

STDMETHODIMP JoinObject::putref_RightTable(IDispatch* value) {
    return answer([&] { object()->RightTable(fromHost<TalvikZandorLib::ZDTable>(value)); });
}

STDMETHODIMP JoinObject::get_RightColumn(IDispatch** value) {
    return answer([&] { give(value, object()->RightColumn()); });
}

STDMETHODIMP JoinObject::putref_RightColumn(IDispatch* value) {
    return answer([&] { object()->RightColumn(fromHost<TalvikZandorLib::ZDColumn>(value)); });
}

STDMETHODIMP JoinObject::get_JoinType(SHORT* value) {
    return answer([&] { give(value, object()->JoinType()); });
}

STDMETHODIMP JoinObject::put_JoinType(SHORT value) {
    return answer([&] { object()->JoinType(value); });
}

STDMETHODIMP JoinObject::get_CompareOperator(SHORT* value) {
    return answer([&] { give(value, object()->CompareOperator()); });
}

STDMETHODIMP JoinObject::put_CompareOperator(SHORT value) {
    return answer([&] { object()->CompareOperator(value); });
}

} // namespace zandor::automation

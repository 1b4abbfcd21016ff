#include "frontends/windows/automation/model/Enumerator.h"

#include "frontends/windows/automation/com/Failure.h"
#include "frontends/windows/automation/com/Value.h"

#include <algorithm>

namespace zandor::automation {

Held<IUnknown> Enumerator::over(_ZDCollection* items, LONG position) {
    return Held<IUnknown>(new Enumerator(items, position));
}

STDMETHODIMP Enumerator::Next(ULONG count, VARIANT* values, ULONG* fetched) {
    if (fetched) *fetched = 0;
    if (!values || (!fetched && count != 1)) return E_POINTER;
    for (ULONG n = 0; n < count; ++n) VariantInit(&values[n]);
    for (ULONG n = 0; n < count; ++n) {
        LONG there = 0;
        HRESULT code = mItems->get_Count(&there);
        if (FAILED(code)) return code;
        if (mPosition > there) return S_FALSE;
        const Value position(static_cast<std::int32_t>(mPosition));
        Held<IDispatch> item;
        code = mItems->Item(position, item.slot());
        if (FAILED(code)) return code;
        values[n].vt = VT_DISPATCH;
        values[n].pdispVal = item.detach();
        ++mPosition;
        if (fetched) ++*fetched;
    }
    return S_OK;
}

STDMETHODIMP Enumerator::Skip(ULONG count) {
    LONG there = 0;
    const HRESULT code = mItems->get_Count(&there);
    if (FAILED(code)) return code;
    const auto left = static_cast<ULONG>(std::max(LONG{0}, there - mPosition + 1));
    mPosition += static_cast<LONG>(std::min(count, left));
    return count <= left ? S_OK : S_FALSE;
}

STDMETHODIMP Enumerator::Reset() {
    mPosition = 1;
    return S_OK;
}

STDMETHODIMP Enumerator::Clone(IEnumVARIANT** other) {
    return answer([&] {
        IEnumVARIANT*& place = placeOf(other);
        place = nullptr;
        place = Held<IEnumVARIANT>::of(over(mItems.get(), mPosition).get()).detach();
    });
}

} // namespace zandor::automation

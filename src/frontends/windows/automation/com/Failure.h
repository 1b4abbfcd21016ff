#pragma once

#include "frontends/windows/automation/com/system.h"

#include <Zandor/platform/RuntimeError.h>

#include <utility>

/// Failures on their way across the boundary: a RuntimeError on this side is a code, with words
/// beside it, on the other.
namespace zandor::automation {

/// The code of a number of the classic runtime's; another one came as a code, and is one.
constexpr HRESULT codeOf(std::int32_t number) {
    constexpr std::int32_t last = 0xFFFF;
    return number > 0 && number <= last
               ? static_cast<HRESULT>(MAKE_HRESULT(SEVERITY_ERROR, FACILITY_CONTROL, number))
               : static_cast<HRESULT>(number);
}

/// Of a code: the number of the classic runtime's where there is one for it, else the code itself,
/// with the system's words for it.
platform::RuntimeError errorOf(HRESULT code);

/// Throws the failure of a call; the words are those that the object left for it, if it is one that
/// leaves words.
void require(HRESULT code, IUnknown* object = nullptr, REFIID iid = IID_NULL);

/// Leaves the words of a failure for the caller, and says its code.
HRESULT leave(const platform::RuntimeError& error);

/// What a caller gets of a member of ours: whatever the body throws becomes a code with words.
template <class Body>
HRESULT answer(Body&& body) noexcept {
    try {
        std::forward<Body>(body)();
        return S_OK;
    } catch (...) {
        try {
            return leave(platform::currentError());
        } catch (...) {
            return E_OUTOFMEMORY;
        }
    }
}

/// Where a caller wants something put; error 5 where that is nowhere.
template <class T>
T& placeOf(T* place) {
    if (!place) throw platform::errors::invalidProcedureCall();
    return *place;
}

} // namespace zandor::automation

#pragma once

#include "frontends/windows/automation/com/Failure.h"
#include "frontends/windows/automation/com/Text.h"
#include "frontends/windows/automation/model/Exchange.h"

#include <cstdint>

/// What a getter of one of our objects hands to a host, by the type of the place that it is put in.
namespace zandor::automation {

inline void give(BSTR* place, const platform::String& text) { placeOf(place) = newText(text); }
inline void give(SHORT* place, bool flag) { placeOf(place) = flag ? VARIANT_TRUE : VARIANT_FALSE; }
inline void give(SHORT* place, std::int16_t number) { placeOf(place) = number; }
inline void give(LONG* place, std::int32_t number) { placeOf(place) = static_cast<LONG>(number); }
inline void give(IDispatch** place, Held<IDispatch> object) { placeOf(place) = object.detach(); }
template <class T>
void give(IDispatch** place, const platform::Ref<T>& object) {
    give(place, toHost(object));
}

} // namespace zandor::automation

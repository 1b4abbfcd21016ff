#pragma once

#include "frontends/windows/automation/com/system.h"
#include "frontends/windows/automation/idl/ids.h"

#include <string_view>

/// The ids of idl/ids.h as values.
namespace zandor::automation::ids {

namespace reading {

constexpr unsigned digit(char c) {
    return static_cast<unsigned>(c <= '9' ? c - '0' : c - 'a' + 10);
}

constexpr unsigned long number(std::string_view text, std::size_t from, std::size_t count) {
    unsigned long value = 0;
    for (const char c : text.substr(from, count)) value = value * 16 + digit(c);
    return value;
}

/// "107ba739-e94e-47d1-ad7b-ee31825a3c31"
constexpr GUID id(std::string_view text) {
    GUID id{number(text, 0, 8),
            static_cast<unsigned short>(number(text, 9, 4)),
            static_cast<unsigned short>(number(text, 14, 4)),
            {}};
    for (std::size_t i = 0; i < 8; ++i)
        id.Data4[i] = static_cast<unsigned char>(number(text, (i < 2 ? 19 : 20) + 2 * i, 2));
    return id;
}

} // namespace reading

#define ZANDOR_SPELLED(given) #given
#define ZANDOR_ID(given) reading::id(ZANDOR_SPELLED(given))
inline constexpr GUID controlLibrary = ZANDOR_ID(ZANDOR_LIBID_CONTROL);
inline constexpr GUID modelLibrary = ZANDOR_ID(ZANDOR_LIBID_MODEL);
inline constexpr GUID control = ZANDOR_ID(ZANDOR_CLSID_CONTROL);
inline constexpr GUID controlEvents = ZANDOR_ID(ZANDOR_IID_CONTROL_EVENTS);
inline constexpr GUID propertyPage = ZANDOR_ID(ZANDOR_CLSID_PROPERTY_PAGE);
inline constexpr GUID query = ZANDOR_ID(ZANDOR_CLSID_QUERY);
inline constexpr GUID join = ZANDOR_ID(ZANDOR_CLSID_JOIN);
inline constexpr GUID columnDefinition = ZANDOR_ID(ZANDOR_CLSID_COLUMN_DEFINITION);
inline constexpr GUID tableDescription = ZANDOR_ID(ZANDOR_CLSID_TABLE_DESCRIPTION);
inline constexpr GUID own = ZANDOR_ID(ZANDOR_IID_OWN);
#undef ZANDOR_ID
#undef ZANDOR_SPELLED

} // namespace zandor::automation::ids

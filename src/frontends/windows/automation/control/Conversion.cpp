#include "frontends/windows/automation/control/Conversion.h"

#include "frontends/windows/automation/com/Failure.h"
#include "frontends/windows/automation/model/Exchange.h"

namespace zandor::automation {

using TalvikDBxZandor::automation::Type;

Value toHost(const platform::Variant& value) {
    return std::visit(
        [](const auto& held) -> Value {
            using T = std::remove_cvref_t<decltype(held)>;
            if constexpr (std::is_same_v<T, std::monostate> ||
                          std::is_same_v<T, std::shared_ptr<void>>)
                return Value();
            else if constexpr (std::is_constructible_v<Value, const T&>)
                return Value(held);
            else
                return Value(automation::toHost(held));
        },
        value);
}

platform::Variant fromHost(Type type, const VARIANT& value) {
    switch (type) {
    case Type::String: return stringOf(value);
    case Type::Boolean: return flagOf(value);
    case Type::Integer: return integerOf(value);
    case Type::Zandor: return fromHost<TalvikZandorLib::Zandor>(objectOf(value).get());
    default: throw platform::errors::typeMismatch();
    }
}

} // namespace zandor::automation

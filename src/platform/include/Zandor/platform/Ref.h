#pragma once

#include <Zandor/platform/RuntimeError.h>

#include <memory>
#include <utility>

namespace zandor::platform {

/// A counted object reference. Using a member through a reference that holds nothing is error 91,
/// never undefined behaviour: a host may hand over or return nothing at any place.
template <class T>
class Ref : public std::shared_ptr<T> {
public:
    using std::shared_ptr<T>::shared_ptr;
    Ref() = default;
    /// Shares what the other holds.
    Ref(std::shared_ptr<T> other) : std::shared_ptr<T>(std::move(other)) {}

    /// Error 91 when it holds nothing.
    T* operator->() const { return &**this; }
    /// Error 91 when it holds nothing.
    T& operator*() const {
        if (!this->get()) throw errors::objectNotSet();
        return *this->get();
    }
};

/// A new object, counted.
template <class T, class... Arguments>
Ref<T> makeRef(Arguments&&... arguments) {
    return std::make_shared<T>(std::forward<Arguments>(arguments)...);
}

} // namespace zandor::platform

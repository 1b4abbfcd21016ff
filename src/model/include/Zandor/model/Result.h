#pragma once

#include <utility>
#include <variant>

namespace zandor::model {

/// A value, or the error that kept it from being made. An error has a `text`: one line that says
/// what went wrong and what to do about it, ready to be shown to a user.
template <class T, class Error>
class Result {
public:
    Result(T value) : mContent(std::move(value)) {}
    Result(Error error) : mContent(std::move(error)) {}

    explicit operator bool() const { return std::holds_alternative<T>(mContent); }
    /// Only for a result that holds a value. Not for a temporary one: what is taken from it in the
    /// head of a loop would be gone in the body.
    T& operator*() & { return std::get<T>(mContent); }
    const T& operator*() const& { return std::get<T>(mContent); }
    void operator*() && = delete;
    T* operator->() & { return &**this; }
    const T* operator->() const& { return &**this; }
    void operator->() && = delete;
    /// The error's text; empty for a result that holds a value.
    auto error() const {
        const Error* error = std::get_if<Error>(&mContent);
        return error ? error->text : decltype(error->text)();
    }

private:
    std::variant<T, Error> mContent;
};

} // namespace zandor::model

#pragma once

#include <utility>
#include <variant>

namespace zandor::model {

/// A value, or the error that kept it from being made. An error has a message, whose words are made
/// where it is shown, and a `text()`: one line in English that says what went wrong and what to do
/// about it.
template <class T, class Error>
class Result {
public:
    /// It went well.
    Result(T value) : mContent(std::move(value)) {}
    /// It did not.
    Result(Error error) : mContent(std::move(error)) {}

    /// Whether it holds a value.
    explicit operator bool() const { return std::holds_alternative<T>(mContent); }
    /// Only for a result that holds a value. Not for a temporary one: what is taken from it in the
    /// head of a loop would be gone in the body.
    T& operator*() & { return std::get<T>(mContent); }
    /// As above.
    const T& operator*() const& { return std::get<T>(mContent); }
    void operator*() && = delete;
    /// As the value itself, for its members.
    T* operator->() & { return &**this; }
    /// As above.
    const T* operator->() const& { return &**this; }
    void operator->() && = delete;
    /// The error's text; empty for a result that holds a value.
    auto error() const {
        const Error* error = std::get_if<Error>(&mContent);
        return error ? error->text() : decltype(error->text())();
    }
    /// Only for a result that holds an error: the error itself, with its code.
    const Error& failure() const { return std::get<Error>(mContent); }

private:
    std::variant<T, Error> mContent;
};

} // namespace zandor::model

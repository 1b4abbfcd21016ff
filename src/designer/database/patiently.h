#pragma once

#include <QFuture>
#include <QString>

#include <functional>
#include <memory>
#include <optional>

class QWidget;

namespace zandor::designer {

/// Runs work that mostly waits on another thread.
QFuture<void> startOnThread(std::function<void()> work);

/// Runs work on another thread and waits for it while windows are still painted. When it takes
/// longer than a moment, a small dialog over `window` says what is waited for, and the user may
/// cancel. Returns whether the work is done; when it is not it goes on, and what it refers to has
/// to live on with it.
bool runPatiently(const QString& what, QWidget* window, std::function<void()> work);

/// What work gives, or nothing when the user did not want to wait for it.
template <class T>
std::optional<T> patiently(const QString& what, QWidget* window, std::function<T()> work) {
    const auto result = std::make_shared<std::optional<T>>();
    if (!runPatiently(what, window, [result, work = std::move(work)] { result->emplace(work()); }))
        return {};
    return std::move(*result);
}

} // namespace zandor::designer

#pragma once

#include <QObject>
#include <QWidget>

#include <functional>

namespace zandor::platform::qt {

/// Notices that the user turns from an open editor to something else in its window: by the focus,
/// by a press of the mouse even where that takes no focus, by a shortcut of the host's, or by
/// closing the window. A menu, a list that drops down or another window in front do not count.
class EditorWatch final : public QObject {
public:
    /// The editor is the watch's parent. `left` is called before the other thing learns of it.
    EditorWatch(QWidget& editor, std::function<void()> left);

    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    bool isInside(const QWidget* widget) const;
    /// Whether an event on its way to somebody means that the editor is left.
    bool leaves(QObject* watched, const QEvent& event) const;

    QWidget& mEditor;
    std::function<void()> mLeft;
};

} // namespace zandor::platform::qt

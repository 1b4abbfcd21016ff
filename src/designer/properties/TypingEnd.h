#pragma once

#include <QObject>

#include <functional>

class QWidget;

namespace zandor::designer {

/// Tells when what is being typed in a panel has to count: the keyboard goes elsewhere, or somebody
/// clicks elsewhere in the window or presses the keys of a command while it stays there.
class TypingEnd final : public QObject {
public:
    /// `ended` is called at these moments as long as a part of the panel has the keyboard, whether
    /// or not anything was typed.
    TypingEnd(QWidget& panel, std::function<void()> ended);

    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    bool isOwn(const QWidget* part) const;
    bool isTyping() const;

    QWidget& mPanel;
    const std::function<void()> mEnded;
};

} // namespace zandor::designer

#pragma once

#include <QLabel>

namespace zandor::designer {

/// A line of a dialog that says what went wrong: wrapped, to be selected and copied, and not there
/// as long as there is nothing to say.
class ErrorLine final : public QLabel {
    Q_OBJECT

public:
    explicit ErrorLine(QWidget* parent = nullptr);

    void say(const QString& error);

protected:
    void changeEvent(QEvent* event) override;

private:
    void colour();
};

} // namespace zandor::designer

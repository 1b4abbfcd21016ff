#pragma once

#include <QFrame>

class QLabel;
class QPushButton;

namespace zandor::designer {

/// A slim bar above the drawing for what is wrong. It stays until that is over or somebody closes
/// it; hidden at first.
class Banner : public QFrame {
    Q_OBJECT

public:
    explicit Banner(QWidget* parent = nullptr);

    /// Beside the text, the first one outermost.
    QPushButton* addButton(const QString& text, const QString& name);
    /// Shows itself with a text, which is plain whatever stands in it.
    void say(const QString& text, const QString& toolTip = {});
    QString text() const;

protected:
    void changeEvent(QEvent* event) override;

private:
    void colour();

    QLabel* mText;
};

} // namespace zandor::designer

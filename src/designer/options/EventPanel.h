#pragma once

#include <QWidget>

class QPushButton;
class QTreeWidget;
class ZandorWidget;

namespace zandor::designer {

/// The control's events as they come, for those who want to know what a host is told. The newest is
/// at the bottom; the oldest go when there are too many.
class EventPanel final : public QWidget {
    Q_OBJECT

public:
    static constexpr int mostEvents = 1000;

    explicit EventPanel(QWidget* parent = nullptr);

    QSize minimumSizeHint() const override { return {200, 120}; }

    /// Listens to a control from now on, as long as it is there.
    void watch(ZandorWidget* control);
    void clear();
    /// Puts the selected events on the clipboard, or all when none is selected: a line each, with
    /// tabs between the columns.
    void copy();

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    /// An event that the control's interface names.
    void add(const char* name, const QString& arguments);
    void add(const QString& name, const QString& number, const QString& arguments);
    void offerButtons();

    QTreeWidget* mEvents;
    QPushButton* mClear;
    QPushButton* mCopy;
};

} // namespace zandor::designer

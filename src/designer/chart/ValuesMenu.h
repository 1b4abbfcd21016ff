#pragma once

#include <QMenu>

namespace zandor::designer {

/// The columns to be ticked for the values of a chart. It stays open while they are.
class ValuesMenu final : public QMenu {
    Q_OBJECT

public:
    using QMenu::QMenu;

    /// Offers columns by their numbers, with those ticked that are chosen.
    void offer(const QStringList& columns, const std::vector<int>& offered,
               const std::vector<int>& chosen);
    std::vector<int> chosen() const;

signals:
    void changed();

protected:
    void mouseReleaseEvent(QMouseEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    bool tick(QAction* action);
    void limit();
};

} // namespace zandor::designer

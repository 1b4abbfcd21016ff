#include "designer/chart/ValuesMenu.h"

#include "designer/chart/ChartData.h"
#include "frontends/qt/ShownText.h"

#include <QKeyEvent>

#include <algorithm>

namespace zandor::designer {

void ValuesMenu::offer(const QStringList& columns, const std::vector<int>& offered,
                       const std::vector<int>& chosen) {
    clear();
    for (const int column : offered) {
        QString name = platform::qt::asSigns(columns[column]);
        QAction* const action = addAction(name.replace(u'&', QStringLiteral("&&")));
        action->setCheckable(true);
        action->setData(column);
        action->setChecked(std::find(chosen.begin(), chosen.end(), column) != chosen.end());
        connect(action, &QAction::toggled, this, [this] {
            limit();
            emit changed();
        });
    }
    limit();
}

std::vector<int> ValuesMenu::chosen() const {
    std::vector<int> result;
    for (const QAction* action : actions())
        if (action->isChecked()) result.push_back(action->data().toInt());
    return result;
}

/// No more than there are colours.
void ValuesMenu::limit() {
    const bool full = chosen().size() >= mostSeries;
    for (QAction* action : actions()) action->setEnabled(action->isChecked() || !full);
}

bool ValuesMenu::tick(QAction* action) {
    if (!action || !action->isEnabled()) return false;
    action->toggle();
    return true;
}

void ValuesMenu::mouseReleaseEvent(QMouseEvent* event) {
    if (!tick(activeAction())) QMenu::mouseReleaseEvent(event);
}

void ValuesMenu::keyPressEvent(QKeyEvent* event) {
    if (event->key() != Qt::Key_Space || !tick(activeAction())) QMenu::keyPressEvent(event);
}

} // namespace zandor::designer

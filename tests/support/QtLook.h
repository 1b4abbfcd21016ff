#pragma once

#include "frontends/qt/ColumnListModel.h"
#include "frontends/qt/PickListWidget.h"
#include "frontends/qt/TabuletWidget.h"
#include "support/Stage.h"

#include <Zandor/qt/Text.h>

#include <QAbstractButton>
#include <QAbstractItemView>
#include <QComboBox>
#include <QDialog>
#include <QLabel>
#include <QLineEdit>
#include <QListView>
#include <QScrollBar>

namespace hands {

/// What a user sees of a widget of its kind: texts, items, values.
inline void lookAtKind(QWidget& widget, Stage::Seen& seen) {
    using zandor::platform::qt::fromQt;
    if (const auto* button = dynamic_cast<QAbstractButton*>(&widget)) {
        seen.text = fromQt(button->text());
    } else if (const auto* label = dynamic_cast<QLabel*>(&widget)) {
        seen.text = fromQt(label->text());
    } else if (const auto* input = dynamic_cast<QLineEdit*>(&widget)) {
        seen.text = fromQt(input->text());
    } else if (const auto* dialog = dynamic_cast<QDialog*>(&widget)) {
        seen.text = fromQt(dialog->windowTitle());
    } else if (const auto* combo = dynamic_cast<QComboBox*>(&widget)) {
        seen.text = fromQt(combo->currentText());
        seen.listIndex = static_cast<std::int16_t>(combo->currentIndex());
        seen.dropped = combo->view()->isVisible();
        for (int i = 0; i < combo->count(); ++i) seen.items.push_back(fromQt(combo->itemText(i)));
    } else if (const auto* bar = dynamic_cast<QScrollBar*>(&widget)) {
        seen.value = static_cast<std::int16_t>(bar->value());
        seen.max = static_cast<std::int16_t>(bar->maximum());
        seen.largeChange = static_cast<std::int16_t>(bar->pageStep());
    } else if (const auto* list = dynamic_cast<zandor::platform::qt::PickListWidget*>(&widget)) {
        seen.text = fromQt(list->box().text());
        const QAbstractItemModel& left = *list->list().model();
        for (int row = 0; row < left.rowCount(); ++row)
            seen.items.push_back(fromQt(left.index(row, 0).data().toString()));
    } else if (const auto* table = dynamic_cast<zandor::platform::qt::TabuletWidget*>(&widget)) {
        seen.text = fromQt(table->title());
        for (int row = 0; row < table->model().rowCount(); ++row) {
            seen.items.push_back(fromQt(table->model().text(row)));
            using zandor::platform::qt::ColumnListModel;
            if (table->model().index(row).data(ColumnListModel::outputRole).toBool())
                seen.output.push_back(seen.items.back());
            if (table->model().picture(row) == zandor::platform::Picture::key)
                seen.keys.push_back(seen.items.back());
            if (table->list().selectionModel()->isRowSelected(row))
                seen.selected.push_back(seen.items.back());
        }
    }
}

} // namespace hands

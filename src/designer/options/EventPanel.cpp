#include "designer/options/EventPanel.h"

#include "designer/options/EventWords.h"
#include "frontends/qt/ShownText.h"
#include "frontends/qt/ZandorWindowMessage.h"

#include <Zandor/Interface.h>
#include <Zandor/ZandorWidget.h>
#include <Zandor/qt/Text.h>

#include <QBoxLayout>
#include <QClipboard>
#include <QEvent>
#include <QGuiApplication>
#include <QHeaderView>
#include <QPushButton>
#include <QScrollBar>
#include <QShortcut>
#include <QTime>
#include <QTreeWidget>

namespace zandor::designer {

using platform::qt::asSigns;
using platform::qt::asToolTip;

namespace {

enum Column { timeColumn, numberColumn, nameColumn, argumentsColumn, columnCount };

const QString menuMessage = QStringLiteral("TALVIKDISABLEVELT");

QString numberOf(const char* name) {
    for (const auto& event : TalvikDBxZandor::automation::events())
        if (platform::qt::toQt(event.name) == QLatin1String(name))
            return QString::number(static_cast<int>(event.number));
    return {};
}

} // namespace

EventPanel::EventPanel(QWidget* parent)
    : QWidget(parent), mEvents(new QTreeWidget), mClear(new QPushButton(tr("Clear"))),
      mCopy(new QPushButton(tr("Copy"))) {
    mEvents->setColumnCount(columnCount);
    mEvents->setHeaderLabels({tr("Time"), tr("No."), tr("Event"), tr("Arguments")});
    mEvents->setRootIsDecorated(false);
    mEvents->setUniformRowHeights(true);
    mEvents->setAlternatingRowColors(true);
    mEvents->setSelectionMode(QAbstractItemView::ExtendedSelection);
    mEvents->setFrameShape(QFrame::NoFrame);
    mEvents->setAccessibleName(tr("Events of the control"));
    const auto room = [this](const QString& text) {
        return mEvents->fontMetrics().horizontalAdvance(text) + 16;
    };
    mEvents->setColumnWidth(timeColumn, room(QStringLiteral("00:00:00.000")));
    mEvents->setColumnWidth(numberColumn, room(QStringLiteral("-000")));
    mEvents->setColumnWidth(nameColumn, room(menuMessage));
    mCopy->setToolTip(tr("Copy the selected events, or all of them"));

    auto* const top = new QHBoxLayout;
    top->setContentsMargins(6, 4, 6, 4);
    top->setSpacing(6);
    top->addStretch(1);
    top->addWidget(mCopy);
    top->addWidget(mClear);
    auto* const layout = new QVBoxLayout(this);
    layout->setContentsMargins({});
    layout->setSpacing(0);
    layout->addLayout(top);
    layout->addWidget(mEvents, 1);

    connect(mClear, &QPushButton::clicked, this, &EventPanel::clear);
    connect(mCopy, &QPushButton::clicked, this, &EventPanel::copy);
    auto* const shortcut = new QShortcut(QKeySequence::Copy, mEvents);
    shortcut->setContext(Qt::WidgetShortcut);
    connect(shortcut, &QShortcut::activated, this, &EventPanel::copy);
    offerButtons();
}

void EventPanel::watch(ZandorWidget* control) {
    using Widget = ZandorWidget;
    connect(control, &Widget::TableDeleted, this, [this, control] {
        add("TableDeleted", tr("DeletedTable: %1").arg(control->DeletedTable()));
    });
    connect(control, &Widget::TableMoved, this, [this] { add("TableMoved", {}); });
    connect(control, &Widget::Activate, this, [this] { add("Activate", {}); });
    connect(control, &Widget::ColumnCreated, this,
            [this](const auto& definition) { add("ColumnCreated", wordsFor(definition)); });
    connect(control, &Widget::ColumnModified, this,
            [this](const auto& definition) { add("ColumnModified", wordsFor(definition)); });
    connect(control, &Widget::ColumnRemoved, this,
            [this](const auto& definition) { add("ColumnRemoved", wordsFor(definition)); });
    connect(control, &Widget::Error, this, [this](const QString& text, int number) {
        add("Error", tr("%1 (number %2)").arg(text, QString::number(number)));
    });
    connect(control, &Widget::JoinCreated, this,
            [this](const auto& join) { add("JoinCreated", wordsFor(join)); });
    connect(control, &Widget::JoinModified, this,
            [this](const auto& join) { add("JoinModified", wordsFor(join)); });
    connect(control, &Widget::JoinRemoved, this,
            [this](const auto& join) { add("JoinRemoved", wordsFor(join)); });
    control->installEventFilter(this);
}

bool EventPanel::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() == ZandorWindowMessage::typeOf(menuMessage)) {
        const auto wParam = static_cast<ZandorWindowMessage*>(event)->wParam();
        add(menuMessage, {},
            (wParam == 0 ? tr("wParam %1: the menu opens") : tr("wParam %1: the menu is closed"))
                .arg(wParam));
    }
    return QWidget::eventFilter(watched, event);
}

void EventPanel::add(const char* name, const QString& arguments) {
    add(QString::fromLatin1(name), numberOf(name), arguments);
}

void EventPanel::add(const QString& name, const QString& number, const QString& arguments) {
    const QScrollBar* const bar = mEvents->verticalScrollBar();
    const bool atEnd = bar->value() == bar->maximum();
    auto* const item =
        new QTreeWidgetItem(mEvents, {QTime::currentTime().toString(QStringLiteral("HH:mm:ss.zzz")),
                                      number, name, asSigns(arguments)});
    item->setTextAlignment(numberColumn, Qt::AlignRight | Qt::AlignVCenter);
    item->setToolTip(nameColumn, asToolTip(name));
    item->setToolTip(argumentsColumn, asToolTip(arguments));
    while (mEvents->topLevelItemCount() > mostEvents) delete mEvents->takeTopLevelItem(0);
    // Who has scrolled back reads there.
    if (atEnd) mEvents->scrollToBottom();
    offerButtons();
}

void EventPanel::clear() {
    mEvents->clear();
    offerButtons();
}

void EventPanel::copy() {
    const bool all = mEvents->selectedItems().isEmpty();
    QStringList lines;
    for (int row = 0; row < mEvents->topLevelItemCount(); ++row) {
        const QTreeWidgetItem& item = *mEvents->topLevelItem(row);
        if (!all && !item.isSelected()) continue;
        QStringList cells;
        for (int column = 0; column < columnCount; ++column) cells << item.text(column);
        lines << cells.join(u'\t');
    }
    if (!lines.isEmpty())
        QGuiApplication::clipboard()->setText(lines.join(u'\n') + QLatin1Char('\n'));
}

void EventPanel::offerButtons() {
    const bool any = mEvents->topLevelItemCount() > 0;
    mClear->setEnabled(any);
    mCopy->setEnabled(any);
}

} // namespace zandor::designer

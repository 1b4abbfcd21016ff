#include "designer/chart/ChartPanel.h"

#include "designer/chart/ChartPicture.h"
#include "designer/chart/ChartView.h"
#include "designer/chart/ValuesMenu.h"
#include "designer/show/askForPicture.h"
#include "frontends/qt/ShownText.h"

#include <QAction>
#include <QBoxLayout>
#include <QComboBox>
#include <QDir>
#include <QLabel>
#include <QPushButton>
#include <QSignalBlocker>
#include <QStandardPaths>
#include <QToolButton>

#include <algorithm>

namespace zandor::designer {

namespace {

constexpr QSize smallestPicture(640, 400); // logical pixels
constexpr int shortestCombo = 8;           // characters

ColumnUse useOf(const std::vector<ColumnUse>& uses, int column) {
    const auto place = static_cast<std::size_t>(column);
    return column >= 0 && place < uses.size() ? uses[place] : ColumnUse::none;
}

} // namespace

ChartPanel::ChartPanel(QWidget* parent) : QWidget(parent) {
    makeActions();
    makeLayout();
    setFocusProxy(mView);
    say({});
}

void ChartPanel::makeActions() {
    mCopy = new QAction(tr("Cop&y"), this);
    mCopy->setObjectName(QStringLiteral("copyChart"));
    mCopy->setToolTip(tr("Copy the chart as a picture"));
    mCopy->setShortcut(QKeySequence::Copy);
    mCopy->setShortcutContext(Qt::WidgetWithChildrenShortcut);
    connect(mCopy, &QAction::triggered, this, &ChartPanel::copy);
    mExport = new QAction(tr("E&xport\u2026"), this);
    mExport->setObjectName(QStringLiteral("exportChart"));
    mExport->setToolTip(tr("Export the chart as PNG, SVG or PDF"));
    connect(mExport, &QAction::triggered, this, &ChartPanel::askForFile);
}

void ChartPanel::makeLayout() {
    auto* const bar = new QHBoxLayout;
    bar->setContentsMargins(6, 4, 6, 4);
    bar->setSpacing(6);
    const auto labelled = [&](const QString& text, const char* name) {
        auto* const label = new QLabel(text, this);
        auto* const combo = new QComboBox(this);
        combo->setObjectName(QLatin1String(name));
        combo->setSizeAdjustPolicy(QComboBox::AdjustToContents);
        combo->setMinimumContentsLength(shortestCombo);
        combo->setSizePolicy(QSizePolicy::Maximum, QSizePolicy::Fixed);
        label->setBuddy(combo);
        bar->addWidget(label);
        bar->addWidget(combo);
        return combo;
    };
    mKind = labelled(tr("&Kind:"), "chartKind");
    mKind->addItems({tr("Columns"), tr("Lines")});
    mAxis = labelled(tr("&Axis:"), "chartAxis");
    mAxis->setToolTip(tr("The column whose values stand below"));
    mMenu = new ValuesMenu(this);
    mValues = new QPushButton(this);
    mValues->setObjectName(QStringLiteral("chartValues"));
    mValues->setText(tr("Val&ues"));
    mValues->setToolTip(tr("The columns that are drawn"));
    mValues->setMenu(mMenu);
    bar->addWidget(mValues);
    bar->addStretch();
    for (QAction* action : {mCopy, mExport}) {
        auto* const button = new QToolButton(this);
        button->setDefaultAction(action);
        button->setAutoRaise(true);
        bar->addWidget(button);
    }
    mView = new ChartView(this);
    mView->addActions({mCopy, mExport});
    auto* const layout = new QVBoxLayout(this);
    layout->setContentsMargins({});
    layout->setSpacing(0);
    layout->addLayout(bar);
    layout->addWidget(mView, 1);
    for (QComboBox* combo : {mKind, mAxis})
        connect(combo, &QComboBox::currentIndexChanged, this, &ChartPanel::choose);
    connect(mMenu, &ValuesMenu::changed, this, &ChartPanel::choose);
}

void ChartPanel::show(const ChartSource& source) {
    const bool known = source.columns == mSource.columns;
    mSource = source;
    mUses = columnUses(mSource);
    if (!known || !isPossible(mChoice)) mChoice = bestChoice(mSource.columns, mUses);
    offer();
    draw();
}

void ChartPanel::say(const QString& why) {
    mSource.rows = 0;
    mSource.cell = {};
    mUses.assign(static_cast<std::size_t>(mSource.columns.size()), ColumnUse::none);
    for (QWidget* part : {static_cast<QWidget*>(mKind), static_cast<QWidget*>(mAxis),
                          static_cast<QWidget*>(mValues)})
        part->setEnabled(false);
    for (QAction* action : {mCopy, mExport}) action->setEnabled(false);
    mView->say(why);
}

bool ChartPanel::isPossible(const ChartChoice& choice) const {
    return useOf(mUses, choice.axis) != ColumnUse::none && !choice.values.empty() &&
           std::all_of(choice.values.begin(), choice.values.end(), [&](int column) {
               return column != choice.axis && useOf(mUses, column) == ColumnUse::number;
           });
}

/// The columns that can be values.
std::vector<int> ChartPanel::numbers() const {
    std::vector<int> result;
    for (int column = 0; column < mSource.columns.size(); ++column)
        if (useOf(mUses, column) == ColumnUse::number && column != mChoice.axis)
            result.push_back(column);
    return result;
}

void ChartPanel::offer() {
    const QSignalBlocker quietKind(mKind);
    const QSignalBlocker quietAxis(mAxis);
    const QSignalBlocker quietMenu(mMenu);
    mKind->setCurrentIndex(mChoice.kind == ChartKind::columns ? 0 : 1);
    mAxis->clear();
    for (int column = 0; column < mSource.columns.size(); ++column)
        if (useOf(mUses, column) != ColumnUse::none)
            mAxis->addItem(platform::qt::asSigns(mSource.columns[column]), column);
    mAxis->setCurrentIndex(mAxis->findData(mChoice.axis));
    mMenu->offer(mSource.columns, numbers(), mChoice.values);
    mKind->setEnabled(true);
    mAxis->setEnabled(mAxis->count() > 0);
    mValues->setEnabled(!mMenu->isEmpty());
}

void ChartPanel::choose() {
    const int axis = mAxis->currentData().toInt();
    mChoice.kind = mKind->currentIndex() == 0 ? ChartKind::columns : ChartKind::lines;
    mChoice.values = mMenu->chosen();
    if (axis != mChoice.axis) {
        mChoice.axis = axis;
        std::erase(mChoice.values, axis);
        offer();
    }
    draw();
}

void ChartPanel::draw() {
    const bool anyNumber = std::count(mUses.begin(), mUses.end(), ColumnUse::number) > 0;
    if (mSource.rows == 0)
        mView->say(tr("There are no rows to draw."));
    else if (!anyNumber)
        mView->say(tr("A chart needs a column of numbers, and these rows have none."));
    else if (mChoice.axis < 0)
        mView->say(tr("A chart needs a column of texts or dates beside the numbers, and these "
                      "rows have none."));
    else if (mChoice.values.empty())
        mView->say(tr("Choose under \"Values\" what is to be drawn."));
    else
        mView->show(readChart(mSource, mChoice));
    for (QAction* action : {mCopy, mExport}) action->setEnabled(mView->data().has_value());
}

void ChartPanel::copy() {
    if (mView->data())
        copyPicture(
            ChartPicture(*mView->data(), font(), mView->size().expandedTo(smallestPicture)));
}

void ChartPanel::askForFile() {
    if (!mView->data()) return;
    const ChartPicture picture(*mView->data(), font(), mView->size().expandedTo(smallestPicture));
    const QDir pictures(QStandardPaths::writableLocation(QStandardPaths::PicturesLocation));
    askForPicture(window(), tr("Export chart"),
                  mProposed.isEmpty() ? pictures.filePath(tr("chart.png")) : mProposed, picture);
}

} // namespace zandor::designer

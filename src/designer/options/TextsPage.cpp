#include "designer/options/TextsPage.h"

#include "designer/options/ControlOptions.h"
#include "designer/options/ControlProperties.h"
#include "designer/options/ControlTexts.h"
#include "frontends/qt/ShownText.h"

#include <QBoxLayout>
#include <QHeaderView>
#include <QLabel>
#include <QMenu>
#include <QPushButton>
#include <QSignalBlocker>
#include <QTableWidget>

namespace zandor::designer {

namespace {

constexpr int useColumn = 0;
constexpr int textColumn = 1;

std::vector<const ControlProperty*> textProperties() {
    std::vector<const ControlProperty*> result;
    for (const ControlProperty& property : controlProperties())
        if (property.page == ControlProperty::Page::texts) result.push_back(&property);
    return result;
}

} // namespace

TextsPage::TextsPage(QWidget* parent) : QWidget(parent), mTable(new QTableWidget) {
    const auto properties = textProperties();
    mTable->setColumnCount(2);
    mTable->setRowCount(static_cast<int>(properties.size()));
    mTable->setHorizontalHeaderLabels({tr("Where it is used"), tr("Text")});
    mTable->horizontalHeader()->setSectionResizeMode(useColumn, QHeaderView::ResizeToContents);
    mTable->horizontalHeader()->setSectionResizeMode(textColumn, QHeaderView::Stretch);
    mTable->horizontalHeader()->setDefaultAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    mTable->horizontalHeader()->setHighlightSections(false);
    mTable->verticalHeader()->hide();
    mTable->verticalHeader()->setDefaultSectionSize(mTable->fontMetrics().lineSpacing() + 8);
    mTable->setWordWrap(false);
    mTable->setAlternatingRowColors(true);
    mTable->setShowGrid(false);
    mTable->setSelectionMode(QAbstractItemView::SingleSelection);
    mTable->setEditTriggers(QAbstractItemView::DoubleClicked | QAbstractItemView::SelectedClicked |
                            QAbstractItemView::EditKeyPressed | QAbstractItemView::AnyKeyPressed);
    mTable->setAccessibleName(tr("Texts of the control"));
    for (int row = 0; row < mTable->rowCount(); ++row) {
        const ControlProperty& property = *properties[static_cast<std::size_t>(row)];
        auto* const use = new QTableWidgetItem(wordsFor(property));
        use->setFlags(Qt::ItemIsEnabled | Qt::ItemIsSelectable);
        use->setToolTip(
            platform::qt::asToolTip(QStringLiteral("%1\n%2").arg(use->text(), property.name)));
        mTable->setItem(row, useColumn, use);
        mTable->setItem(row, textColumn, new QTableWidgetItem);
    }

    auto* const set = new QPushButton(tr("Set of texts"));
    auto* const menu = new QMenu(set);
    for (const controlTexts::Language& language : controlTexts::languages())
        menu->addAction(QString::fromUtf16(language.name), this,
                        [this, code = language.code] { fill(code); });
    set->setMenu(menu);
    auto* const explanation =
        new QLabel(tr("Texts that are left as they are follow the designer's language. Emptying "
                      "one brings its text of that language back."));
    explanation->setWordWrap(true);

    auto* const below = new QHBoxLayout;
    below->addWidget(explanation, 1);
    below->addWidget(set, 0, Qt::AlignTop);
    auto* const layout = new QVBoxLayout(this);
    layout->addWidget(mTable, 1);
    layout->addLayout(below);

    connect(mTable, &QTableWidget::itemChanged, this, [this](QTableWidgetItem* item) {
        if (item->text().isEmpty()) {
            const QSignalBlocker quiet(mTable);
            const auto& property = *textProperties()[static_cast<std::size_t>(item->row())];
            item->setText(ControlOptions().value(property).toString());
        }
        emit edited();
    });
}

void TextsPage::setOptions(const ControlOptions& options) {
    const QSignalBlocker quiet(mTable);
    int row = 0;
    for (const ControlProperty* property : textProperties())
        mTable->item(row++, textColumn)->setText(options.value(*property).toString());
}

void TextsPage::collect(ControlOptions& options) const {
    int row = 0;
    for (const ControlProperty* property : textProperties())
        options.choose(*property, mTable->item(row++, textColumn)->text());
}

void TextsPage::fill(const char* language) {
    ControlOptions options;
    const auto properties = textProperties();
    for (const ControlProperty* property : properties)
        for (const controlTexts::Text& text : controlTexts::all())
            if (property->name == QLatin1String(text.property))
                options.choose(*property, controlTexts::inLanguage(text, language));
    setOptions(options);
    emit edited();
}

} // namespace zandor::designer

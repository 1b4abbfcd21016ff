#include "designer/properties/ColumnPanel.h"

#include "designer/document/Document.h"
#include "designer/properties/FieldEdit.h"
#include "designer/properties/TypingEnd.h"
#include "designer/properties/fields.h"
#include "designer/properties/formats.h"
#include "designer/properties/totals.h"
#include "designer/run/ColumnFormats.h"
#include "designer/statement/ModelWords.h"
#include "frontends/qt/ShownText.h"

#include <Zandor/qt/Text.h>

#include <QAbstractItemView>
#include <QApplication>
#include <QCheckBox>
#include <QComboBox>
#include <QFormLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QScrollArea>
#include <QSignalBlocker>
#include <QSpinBox>
#include <QStandardItemModel>
#include <QStyledItemDelegate>

#include <algorithm>

namespace zandor::designer {

using platform::qt::fromQt;
using platform::qt::toQt;

namespace {

constexpr std::chrono::milliseconds betweenKeys(150);
constexpr int leastHeight = 210; // logical pixels, unless less is needed
constexpr int leastWidth = 80;
constexpr int rowSpacing = 5;
constexpr int aroundFocus = 6;
constexpr int aroundItem = 24; // the frame, and a scroll bar on a low screen

/// Shows the items of a list with what is told of them in full.
class ExampleDelegate final : public QStyledItemDelegate {
public:
    using QStyledItemDelegate::QStyledItemDelegate;

protected:
    void initStyleOption(QStyleOptionViewItem* option, const QModelIndex& index) const override {
        QStyledItemDelegate::initStyleOption(option, index);
        option->text = index.data(Qt::AccessibleTextRole).toString();
    }
};

void setChoosable(QComboBox& combo, int item, bool choosable) {
    auto* const items = qobject_cast<QStandardItemModel*>(combo.model());
    if (items && items->item(item)) items->item(item)->setEnabled(choosable);
}

} // namespace

ColumnPanel::ColumnPanel(Document& document, CurrentColumn& column, QWidget* parent)
    : QWidget(parent), mDocument(document), mColumn(column) {
    makeLayout();
    setFocusProxy(mField);
    mSoon.setInterval(betweenKeys);
    mSoon.setSingleShot(true);
    connect(&mSoon, &QTimer::timeout, this, &ColumnPanel::check);
    connect(&mDocument, &Document::replaced, this, [this] {
        for (QLineEdit* edit : {static_cast<QLineEdit*>(mField), mName}) edit->setModified(false);
    });
    connect(&mColumn, &CurrentColumn::changed, this, &ColumnPanel::follow);
    connect(mField, &QLineEdit::textEdited, &mSoon, qOverload<>(&QTimer::start));
    connect(mField, &QLineEdit::returnPressed, this, &ColumnPanel::takeOver);
    connect(mName, &QLineEdit::returnPressed, this, &ColumnPanel::takeOver);
    connect(mTotal, &QComboBox::activated, this, [this](int item) {
        const auto total = static_cast<model::Total>(mTotal->itemData(item).toInt());
        change([total](auto& definition) { definition.total(total); });
    });
    connect(mSort, &QComboBox::activated, this, [this](int order) {
        change([order](auto& definition) {
            definition.SortOrder(static_cast<std::int16_t>(order));
            if (order == 0) definition.sortPriority(0);
        });
    });
    connect(mPriority, &QSpinBox::valueChanged, this, [this](int value) {
        change([value](auto& definition) {
            definition.sortPriority(static_cast<std::int16_t>(value));
        });
    });
    connect(mFormat, &QComboBox::activated, this, [this](int item) {
        const CellFormat& format = offeredFormats()[static_cast<std::size_t>(item)];
        change([&format](auto& definition) { setFormat(definition, format); });
    });
    connect(mDecimals, &QSpinBox::valueChanged, this, [this](int value) {
        change(
            [value](auto& definition) { definition.decimals(static_cast<std::int16_t>(value)); });
    });
    connect(mShown, &QCheckBox::clicked, this,
            [this](bool on) { change([on](auto& definition) { definition.Visible(on); }); });
    new TypingEnd(*this, [this] { takeOver(); });
    follow();
}

void ColumnPanel::makeLayout() {
    mField = new FieldEdit(this);
    mField->setObjectName(QStringLiteral("columnField"));
    mField->setToolTip(tr("A column, or an expression such as price * (1 - discount)"));
    mTotal = new QComboBox(this);
    mTotal->setObjectName(QStringLiteral("columnTotal"));
    mTotal->setToolTip(tr("What becomes of the values when rows are put together"));
    for (const model::Total total : allTotals())
        mTotal->addItem(nameOf(total).remove(u'&'), static_cast<int>(total));
    mName = new QLineEdit(this);
    mName->setObjectName(QStringLiteral("columnName"));
    mName->setToolTip(tr("What the column is called in the rows"));
    mSort = new QComboBox(this);
    mSort->setObjectName(QStringLiteral("columnSort"));
    mSort->addItems({tr("Not sorted"), tr("Ascending"), tr("Descending")});
    mPriority = new QSpinBox(this);
    mPriority->setObjectName(QStringLiteral("columnPriority"));
    mPriority->setRange(0, model::ColumnDefinition::greatestSortPriority);
    mPriority->setSpecialValueText(tr("as it stands"));
    mPriority->setKeyboardTracking(false);
    mPriority->setToolTip(tr("Which column sorts first: 1 before 2, and both before those that "
                             "sort as they stand, from left to right"));
    mShown = new QCheckBox(tr("Sho&wn in the rows"), this);
    mShown->setObjectName(QStringLiteral("columnShown"));
    mFormat = new QComboBox(this);
    mFormat->setObjectName(QStringLiteral("columnFormat"));
    mFormat->setToolTip(tr("How the values look in the rows; sorting, criteria and exported files "
                           "go by the values themselves"));
    for (const CellFormat& format : offeredFormats()) {
        mFormat->addItem(nameOf(format));
        mFormat->setItemData(mFormat->count() - 1, exampleOf(format), Qt::AccessibleTextRole);
    }
    mFormat->setItemDelegate(new ExampleDelegate(mFormat));
    mDecimals = new QSpinBox(this);
    mDecimals->setObjectName(QStringLiteral("columnDecimals"));
    mDecimals->setRange(model::asManyAsThereAre, model::ColumnDefinition::mostDecimals);
    mDecimals->setSpecialValueText(tr("as many as there are"));
    mDecimals->setKeyboardTracking(false);
    mDecimals->setToolTip(tr("So many digits stand behind the point"));
    mFinding = new QLabel(this);
    mFinding->setObjectName(QStringLiteral("columnFinding"));
    mFinding->setTextFormat(Qt::PlainText);
    mFinding->setWordWrap(true);
    // Its room is there from the beginning: what one is about to click does not move away.
    mFinding->setMinimumHeight(mFinding->fontMetrics().lineSpacing());
    mField->keepInSight(*mFinding);
    mFinding->setTextInteractionFlags(Qt::TextSelectableByMouse);
    // What a number says in words, and a choice with its example, may be cut off rather than make
    // the panel wide.
    for (QSpinBox* number : {mPriority, mDecimals}) number->setMinimumWidth(leastWidth);
    for (QComboBox* combo : {mTotal, mSort, mFormat}) {
        combo->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
        combo->setMinimumContentsLength(6);
        combo->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Fixed);
        // The list may be wider than the panel.
        combo->view()->setMinimumWidth(combo->view()->sizeHintForColumn(0) + aroundItem);
    }
    // What there is to say may need more room than there is.
    auto* const page = new QWidget;
    auto* const scrolled = new QScrollArea(this);
    scrolled->setWidget(page);
    scrolled->setWidgetResizable(true);
    scrolled->setFrameShape(QFrame::NoFrame);
    scrolled->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    scrolled->setFocusPolicy(Qt::NoFocus);
    auto* const layout = new QVBoxLayout(this);
    layout->setContentsMargins({});
    layout->addWidget(scrolled);
    auto* const parts = new QVBoxLayout(page);
    parts->setContentsMargins(8, 6, 8, 6);
    parts->setSpacing(rowSpacing);
    // It has the whole width: expressions are long.
    auto* const field = new QLabel(tr("Fie&ld:"), this);
    field->setBuddy(mField);
    for (QWidget* part : {static_cast<QWidget*>(field), static_cast<QWidget*>(mField),
                          static_cast<QWidget*>(mFinding)})
        parts->addWidget(part);
    auto* const form = new QFormLayout;
    form->setVerticalSpacing(rowSpacing);
    parts->addLayout(form);
    parts->addStretch();
    form->addRow(tr("&Total:"), mTotal);
    form->addRow(tr("&Name:"), mName);
    form->addRow(tr("&Sort:"), mSort);
    form->addRow(tr("&Priority:"), mPriority);
    form->addRow(mShown);
    form->addRow(tr("For&mat:"), mFormat);
    form->addRow(tr("De&cimals:"), mDecimals);
    scrolled->setMinimumHeight(std::min(page->sizeHint().height(), leastHeight));
    // Whichever way the keyboard comes to a part, it comes into sight.
    connect(qApp, &QApplication::focusChanged, scrolled, [page, scrolled](QWidget*, QWidget* now) {
        if (!now || !page->isAncestorOf(now)) return;
        const QRect place(now->mapTo(page, QPoint()), now->size());
        scrolled->ensureVisible(0, place.center().y(), 0, place.height() / 2 + aroundFocus);
    });
}

/// Shows the column that the grid is in; what is being typed about one stays until it counts.
void ColumnPanel::follow() {
    const auto definition = mColumn.definition();
    const platform::String key = definition ? definition->Key() : platform::String();
    if (key == mKey && !mTaking && (mField->isModified() || mName->isModified())) return;
    mKey = key;
    const QSignalBlocker quietPriority(mPriority);
    const QSignalBlocker quietDecimals(mDecimals);
    mField->offer(completions(*mDocument.query()));
    mField->setEnabled(mDocument.query()->Tables().Count() > 0);
    for (QWidget* part :
         {static_cast<QWidget*>(mTotal), static_cast<QWidget*>(mName), static_cast<QWidget*>(mSort),
          static_cast<QWidget*>(mPriority), static_cast<QWidget*>(mShown),
          static_cast<QWidget*>(mFormat), static_cast<QWidget*>(mDecimals)})
        part->setEnabled(definition != nullptr);
    mField->setPlaceholderText(definition ? QString() : tr("a column or an expression"));
    if (definition) {
        show(*definition);
    } else {
        for (QLineEdit* edit : {static_cast<QLineEdit*>(mField), mName}) edit->clear();
        mTotal->setCurrentIndex(0);
        mSort->setCurrentIndex(0);
        mPriority->setValue(0);
        mShown->setChecked(false);
        mFormat->setCurrentIndex(0);
        mDecimals->setValue(model::asManyAsThereAre);
    }
    check();
}

void ColumnPanel::show(const model::ColumnDefinition& definition) {
    const auto put = [](QLineEdit& edit, const QString& text) {
        if (edit.text() != text) edit.setText(text); // which would move the cursor
        edit.setModified(false);
    };
    put(*mField, fieldOf(definition));
    put(*mName, toQt(definition.Synonym()));
    const auto type = typeOf(definition);
    for (int n = 0; n < mTotal->count(); ++n) {
        const auto total = static_cast<model::Total>(mTotal->itemData(n).toInt());
        setChoosable(*mTotal, n, model::suits(total, type) || total == definition.total());
    }
    mTotal->setCurrentIndex(mTotal->findData(static_cast<int>(definition.total())));
    mSort->setCurrentIndex(definition.SortOrder());
    mPriority->setValue(definition.sortPriority());
    mPriority->setEnabled(definition.SortOrder() != 0);
    mShown->setChecked(definition.Visible());
    const auto formats = offeredFormats();
    for (std::size_t n = 0; n < formats.size(); ++n)
        setChoosable(*mFormat, static_cast<int>(n),
                     suits(formats[n].format, outputTypeOf(definition)) ||
                         formats[n].format == definition.format());
    mFormat->setCurrentIndex(placeOf(definition));
    mFormat->setEnabled(!isOfSeveral(definition));
    mDecimals->setValue(definition.decimals());
    mDecimals->setEnabled(model::isOfNumbers(definition.format()));
}

void ColumnPanel::showEvent(QShowEvent* event) {
    QWidget::showEvent(event);
    check();
}

/// Says what is wrong with what stands in the field, whether or not it counts yet.
void ColumnPanel::check() {
    mSoon.stop();
    if (!isVisible()) return; // it costs a copy of the query
    const QString text = mField->text().trimmed();
    QStringList said;
    int from = -1;
    if (!text.isEmpty())
        for (const auto& finding : findingsOf(*mDocument.query(), mKey, text)) {
            said << inWords(finding.message);
            if (finding.kind == model::Finding::Kind::badExpression && from < 0)
                from = static_cast<int>(finding.position) +
                       static_cast<int>(mField->text().indexOf(text));
        }
    mField->mark(from);
    const QString all = said.join(u'\n');
    mFinding->setText(platform::qt::asSigns(all));
    mField->setAccessibleDescription(all);
}

void ColumnPanel::takeOver() {
    if (mTaking) return;
    mTaking = true;
    takeField();
    takeName();
    mPriority->interpretText();
    mDecimals->interpretText();
    mTaking = false;
    follow();
}

void ColumnPanel::takeField() {
    if (!mField->isModified()) return;
    mField->setModified(false);
    const QString text = mField->text().trimmed();
    if (text.isEmpty()) return; // as it was: the grid deletes columns
    const auto definition = mColumn.definition(mKey);
    if (definition && fieldOf(*definition) == text) return;
    mDocument.change({}, [&](model::Query& query) {
        if (const auto known = mColumn.definition(mKey)) return setField(query, *known, text);
        const auto added = platform::makeRef<model::ColumnDefinition>();
        setField(query, *added, text);
        query.AddColumnDefinition(added);
        mKey = added->Key();
    });
}

void ColumnPanel::takeName() {
    if (!mName->isModified()) return;
    mName->setModified(false);
    change([this](auto& definition) { definition.Synonym(fromQt(mName->text().trimmed())); });
}

/// One step, unless nothing comes of it.
void ColumnPanel::change(const std::function<void(model::ColumnDefinition&)>& how) {
    if (!mColumn.definition(mKey)) return;
    // What was typed before counts first, as a step of its own.
    if (!mTaking) takeOver();
    mDocument.change({}, [&](model::Query&) {
        if (const auto definition = mColumn.definition(mKey)) how(*definition);
    });
    follow(); // the next key may come before the grid shows it
}

} // namespace zandor::designer

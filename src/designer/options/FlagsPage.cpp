#include "designer/options/FlagsPage.h"

#include "designer/options/ControlOptions.h"
#include "frontends/qt/ShownText.h"

#include <QBoxLayout>
#include <QCheckBox>
#include <QGroupBox>
#include <QLabel>
#include <QStyle>

#include <algorithm>

namespace zandor::designer {

namespace {

const QString typesPrefix = QStringLiteral("UseJoinType");
const QString operatorsPrefix = QStringLiteral("UseJoinCompareOperator");

QLabel* wrapped(const QString& text) {
    auto* const label = new QLabel(text);
    label->setWordWrap(true);
    return label;
}

} // namespace

FlagsPage::FlagsPage(ControlProperty::Page page, const QString& explanation, QWidget* parent)
    : QWidget(parent), mPage(page) {
    auto* const layout = new QVBoxLayout(this);
    layout->addWidget(wrapped(explanation));
    for (const ControlProperty& property : controlProperties())
        if (property.page == page && !property.name.startsWith(typesPrefix) &&
            !property.name.startsWith(operatorsPrefix))
            addFlag(*layout, property);
    if (page == ControlProperty::Page::joins) {
        addOffer(*layout, tr("Join types offered"), typesPrefix);
        addOffer(*layout, tr("Operators offered"), operatorsPrefix);
    }
    layout->addStretch(1);
}

void FlagsPage::addOffer(QVBoxLayout& layout, const QString& title, const QString& prefix) {
    auto* const group = new QGroupBox(title);
    auto* const inner = new QVBoxLayout(group);
    inner->setSpacing(4);
    const std::size_t first = mFlags.size();
    for (const ControlProperty& property : controlProperties())
        if (property.page == mPage && property.name.startsWith(prefix)) addFlag(*inner, property);
    Offer offer{{}, new QWidget};
    auto* const sign = new QLabel;
    sign->setPixmap(style()->standardIcon(QStyle::SP_MessageBoxWarning).pixmap(16));
    auto* const warning = new QHBoxLayout(offer.warning);
    warning->setContentsMargins({});
    warning->addWidget(sign, 0, Qt::AlignTop);
    warning->addWidget(wrapped(tr("The join dialog counts what it offers: with one left out, each "
                                  "behind it counts as the one before. Leave out only from the "
                                  "end.")),
                       1);
    for (std::size_t n = first; n < mFlags.size(); ++n) offer.boxes.push_back(mFlags[n].box);
    inner->addWidget(offer.warning);
    layout.addWidget(group);
    mOffers.push_back(std::move(offer));
}

void FlagsPage::addFlag(QLayout& layout, const ControlProperty& property) {
    auto* const box = new QCheckBox(wordsFor(property));
    box->setObjectName(property.name);
    box->setToolTip(platform::qt::asToolTip(
        property.also.isEmpty() ? QString(property.name)
                                : QStringLiteral("%1, %2").arg(property.name, property.also)));
    layout.addWidget(box);
    mFlags.push_back({&property, box});
    connect(box, &QCheckBox::clicked, this, [this] {
        warn();
        emit edited();
    });
}

void FlagsPage::setOptions(const ControlOptions& options) {
    for (const auto& [property, box] : mFlags) box->setChecked(options.value(*property).toBool());
    warn();
}

void FlagsPage::collect(ControlOptions& options) const {
    for (const auto& [property, box] : mFlags) options.choose(*property, box->isChecked());
}

void FlagsPage::warn() {
    for (const Offer& offer : mOffers) {
        const auto isOffered = [](const QCheckBox* box) { return box->isChecked(); };
        const auto left = std::find_if_not(offer.boxes.begin(), offer.boxes.end(), isOffered);
        offer.warning->setVisible(std::any_of(left, offer.boxes.end(), isOffered));
    }
}

} // namespace zandor::designer

#include "designer/options/OptionsDialog.h"

#include "designer/options/FlagsPage.h"
#include "designer/options/TextsPage.h"

#include <QBoxLayout>
#include <QDialogButtonBox>
#include <QPushButton>
#include <QScrollArea>
#include <QSettings>
#include <QTabWidget>

namespace zandor::designer {

namespace {

using Page = ControlProperty::Page;

/// So that the dialog goes on a small screen.
QWidget* scrolled(QWidget* page) {
    auto* const area = new QScrollArea;
    area->setWidget(page);
    area->setWidgetResizable(true);
    area->setFrameShape(QFrame::NoFrame);
    return area;
}

} // namespace

OptionsDialog::OptionsDialog(QSettings& settings, QWidget* parent)
    : QDialog(parent), mSettings(settings), mInForce(ControlOptions::read(settings)),
      mTexts(new TextsPage),
      mMenu(new FlagsPage(Page::menu, tr("The entries of the context menu that are shown:"))),
      mJoins(new FlagsPage(Page::joins, tr("What can be done with joins:"))),
      mDebug(new FlagsPage(
          Page::debug,
          tr("For developers: each box must be answered before the control goes on, and there "
             "may be hundreds when a large query is shown."))),
      mButtons(new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel |
                                    QDialogButtonBox::Apply | QDialogButtonBox::RestoreDefaults)) {
    setWindowTitle(tr("Options"));
    auto* const pages = new QTabWidget;
    pages->addTab(mTexts, tr("Texts"));
    pages->addTab(scrolled(mMenu), tr("Menu"));
    pages->addTab(scrolled(mJoins), tr("Joins"));
    pages->addTab(scrolled(mDebug), tr("Debug"));
    auto* const layout = new QVBoxLayout(this);
    layout->addWidget(pages, 1);
    layout->addWidget(mButtons);

    connect(mTexts, &TextsPage::edited, this, &OptionsDialog::offerApply);
    for (FlagsPage* const page : {mMenu, mJoins, mDebug})
        connect(page, &FlagsPage::edited, this, &OptionsDialog::offerApply);
    connect(mButtons, &QDialogButtonBox::accepted, this, [this] {
        apply();
        accept();
    });
    connect(mButtons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    connect(mButtons->button(QDialogButtonBox::Apply), &QPushButton::clicked, this,
            &OptionsDialog::apply);
    connect(mButtons->button(QDialogButtonBox::RestoreDefaults), &QPushButton::clicked, this,
            [this] { setOptions({}); });
    setOptions(mInForce);
    resize(680, 560);
}

void OptionsDialog::setOptions(const ControlOptions& options) {
    mTexts->setOptions(options);
    for (FlagsPage* const page : {mMenu, mJoins, mDebug}) page->setOptions(options);
    offerApply();
}

ControlOptions OptionsDialog::collected() const {
    ControlOptions options;
    mTexts->collect(options);
    for (const FlagsPage* const page : {mMenu, mJoins, mDebug}) page->collect(options);
    return options;
}

void OptionsDialog::apply() {
    const ControlOptions options = collected();
    if (options == mInForce) return;
    mInForce = options;
    options.write(mSettings);
    offerApply();
    emit applied(options);
}

void OptionsDialog::offerApply() {
    mButtons->button(QDialogButtonBox::Apply)->setEnabled(collected() != mInForce);
}

} // namespace zandor::designer

#include "designer/properties/QueryPanel.h"

#include "designer/document/Document.h"
#include "designer/properties/TypingEnd.h"

#include <Zandor/qt/Text.h>

#include <QBoxLayout>
#include <QCheckBox>
#include <QFormLayout>
#include <QLabel>
#include <QPlainTextEdit>
#include <QSignalBlocker>
#include <QSpinBox>

namespace zandor::designer {

using platform::qt::fromQt;
using platform::qt::toQt;

QueryPanel::QueryPanel(Document& document, QWidget* parent)
    : QWidget(parent), mDocument(document),
      mDistinct(new QCheckBox(tr("Equal rows onl&y once"), this)), mFirst(new QSpinBox(this)),
      mDescription(new QPlainTextEdit(this)) {
    mDistinct->setObjectName(QStringLiteral("queryDistinct"));
    mFirst->setObjectName(QStringLiteral("queryFirst"));
    mFirst->setRange(0, model::QueryOptions::greatestFirst);
    mFirst->setSpecialValueText(tr("all"));
    mFirst->setKeyboardTracking(false);
    mFirst->setGroupSeparatorShown(true);
    mFirst->setToolTip(tr("The query itself gives no more rows than these, in the order in which "
                          "it is sorted"));
    mDescription->setObjectName(QStringLiteral("queryDescription"));
    mDescription->setTabChangesFocus(true);
    mDescription->setPlaceholderText(tr("What the query is for. The file keeps it."));
    auto* const label = new QLabel(tr("Descripti&on:"), this);
    label->setBuddy(mDescription);

    auto* const form = new QFormLayout;
    form->addRow(mDistinct);
    form->addRow(tr("Fi&rst rows:"), mFirst);
    auto* const layout = new QVBoxLayout(this);
    layout->setContentsMargins(8, 6, 8, 6);
    layout->addLayout(form);
    layout->addWidget(label);
    layout->addWidget(mDescription, 1);
    setFocusProxy(mDistinct);

    connect(&document, &Document::replaced, this,
            [this] { mDescription->document()->setModified(false); });
    connect(&document, &Document::changed, this, &QueryPanel::follow);
    connect(mDistinct, &QCheckBox::clicked, this, &QueryPanel::takeOver);
    connect(mFirst, &QSpinBox::valueChanged, this, &QueryPanel::takeOver);
    new TypingEnd(*this, [this] {
        mFirst->interpretText();
        takeOver();
    });
    follow();
}

void QueryPanel::follow() {
    const model::QueryOptions& options = mDocument.query()->options();
    const QSignalBlocker quiet(mFirst);
    mDistinct->setChecked(options.distinct);
    mFirst->setValue(options.first);
    if (const QString text = toQt(options.description);
        text != mDescription->toPlainText() && !mDescription->document()->isModified())
        mDescription->setPlainText(text);
    if (toQt(options.description) == mDescription->toPlainText())
        mDescription->document()->setModified(false);
}

void QueryPanel::takeOver() {
    model::QueryOptions options = mDocument.query()->options();
    options.distinct = mDistinct->isChecked();
    options.first = mFirst->value();
    if (mDescription->document()->isModified())
        options.description = fromQt(mDescription->toPlainText());
    mDescription->document()->setModified(false);
    if (options == mDocument.query()->options()) return;
    mDocument.change({}, [&](model::Query& query) { query.options(options); });
}

} // namespace zandor::designer

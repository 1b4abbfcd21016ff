#include "designer/statement/FindBar.h"

#include "designer/statement/SqlView.h"
#include "frontends/qt/ShownText.h"

#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QToolButton>

namespace zandor::designer {

FindBar::FindBar(SqlView& view, QWidget* parent)
    : QWidget(parent), mView(view), mText(new QLineEdit) {
    const auto button = [this](const char* sign, const QString& name, const char* id, auto what) {
        auto* const button = new QToolButton;
        button->setObjectName(QLatin1String(id));
        button->setAutoRaise(true);
        button->setText(QString::fromUtf8(sign));
        button->setToolTip(platform::qt::asToolTip(name));
        button->setAccessibleName(name);
        connect(button, &QToolButton::clicked, this, what);
        return button;
    };
    setObjectName(QStringLiteral("findBar"));
    mText->setObjectName(QStringLiteral("findText"));
    mText->setPlaceholderText(tr("Find in the statement"));
    mText->setAccessibleName(tr("Find in the statement"));
    mText->setClearButtonEnabled(true);
    mText->installEventFilter(this);
    auto* const layout = new QHBoxLayout(this);
    layout->setContentsMargins(6, 2, 6, 2);
    layout->setSpacing(4);
    layout->addWidget(mText, 1);
    layout->addWidget(
        button("\u25b2", tr("Previous (Shift+Enter)"), "findBefore", [this] { findBefore(); }));
    layout->addWidget(button("\u25bc", tr("Next (Enter)"), "findNext", [this] { findNext(); }));
    layout->addWidget(button("\u2715", tr("Close"), "closeFind", [this] { close(); }));
    connect(mText, &QLineEdit::textEdited, this, [this] { find(false, true); });
    connect(&view, &SqlView::findWanted, this, &FindBar::open);
    hide();
}

void FindBar::open() {
    const QString chosen = mView.textCursor().selectedText();
    if (!chosen.isEmpty() && !chosen.contains(QChar::ParagraphSeparator)) mText->setText(chosen);
    show();
    mText->setFocus();
    mText->selectAll();
}

void FindBar::close() {
    hide();
    mView.setFocus();
}

bool FindBar::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() == QEvent::KeyPress) {
        const auto& key = static_cast<const QKeyEvent&>(*event);
        if (key.key() == Qt::Key_Escape) return close(), true;
        if (key.key() == Qt::Key_Return || key.key() == Qt::Key_Enter)
            return find(key.modifiers().testFlag(Qt::ShiftModifier), false), true;
    }
    return QWidget::eventFilter(watched, event);
}

/// Round the end. `fromHere`: what is found already may be found once more, for it has grown.
void FindBar::find(bool backward, bool fromHere) {
    const QString text = mText->text();
    QTextCursor cursor = mView.textCursor();
    if (fromHere) cursor.setPosition(cursor.selectionStart());
    const auto flags = backward ? QTextDocument::FindBackward : QTextDocument::FindFlags();
    QTextCursor found = mView.document()->find(text, cursor, flags);
    if (found.isNull()) {
        cursor.movePosition(backward ? QTextCursor::End : QTextCursor::Start);
        found = mView.document()->find(text, cursor, flags);
    }
    const bool missing = found.isNull() && !text.isEmpty();
    QPalette colours;
    if (missing) colours.setColor(QPalette::Text, QColor(0xd0, 0x30, 0x30));
    mText->setPalette(colours);
    if (!found.isNull()) mView.setTextCursor(found);
}

} // namespace zandor::designer

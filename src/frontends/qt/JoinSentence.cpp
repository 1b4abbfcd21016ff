#include "frontends/qt/JoinSentence.h"

#include "frontends/qt/ShownText.h"

#include <Zandor/qt/Text.h>

#include <QBoxLayout>
#include <QComboBox>
#include <QDialog>
#include <QLabel>
#include <QLineEdit>

namespace zandor::platform::qt {

void addJoinSentence(QDialog& dialog, const comforts::Comforts& comforts) {
    const auto text = [&dialog](const char* name) {
        const auto* box = dialog.findChild<QLineEdit*>(QString::fromLatin1(name));
        return box ? fromQt(box->text()) : String();
    };
    auto* const type = dialog.findChild<QComboBox*>(QStringLiteral("cboJoinType"));
    auto* const symbol = dialog.findChild<QComboBox*>(QStringLiteral("cboJoinCompareOperator"));
    auto* const layout = qobject_cast<QBoxLayout*>(dialog.layout());
    if (!type || !symbol || !layout) return;

    auto* const sentence = new QLabel(&dialog);
    sentence->setObjectName(QStringLiteral("joinSentence"));
    sentence->setTextFormat(Qt::PlainText);
    sentence->setWordWrap(true);
    layout->insertWidget(1, sentence); // below the form
    const auto say = [&dialog, &comforts, text, type, symbol, sentence] {
        const QString said = toQt(comforts.sentenceOf({.LeftTable = text("txtLeftTable"),
                                                       .LeftColumn = text("txtLeftColumn"),
                                                       .RightTable = text("txtRightTable"),
                                                       .RightColumn = text("txtRightColumn"),
                                                       .JoinType = type->currentIndex(),
                                                       .CompareOperator = symbol->currentIndex()}));
        sentence->setText(said);
        dialog.setAccessibleDescription(said);
    };
    QObject::connect(type, &QComboBox::currentIndexChanged, sentence, say);
    QObject::connect(symbol, &QComboBox::currentIndexChanged, sentence, say);
    say();
}

} // namespace zandor::platform::qt

#pragma once

#include "support/QtHands.h"

#include <QAbstractButton>
#include <QFileDialog>
#include <QLineEdit>
#include <QMessageBox>
#include <QTimer>

#include <gtest/gtest.h>

#include <functional>

/// What a person does with the dialogs that stand in the way.

/// The text of a button as it stands there, mnemonics and all.
inline void press(QDialog& dialog, const char* text) {
    for (QAbstractButton* button : dialog.findChildren<QAbstractButton*>()) {
        if (button->text() != QString::fromUtf8(text)) continue;
        hands::click(*button, QRectF(button->rect()).center());
        return;
    }
    ADD_FAILURE() << "no button " << text;
    dialog.reject();
}

inline std::string textOf(const QMessageBox& box) {
    return (box.text() + QLatin1Char('\n') + box.informativeText()).toStdString();
}

/// Lets something run that opens dialogs, one after the other, and answers each. Fails the test
/// when fewer or more come, or ones of another kind.
class Answering {
public:
    explicit Answering(std::vector<std::function<void(QDialog&)>> answers)
        : mAnswers(std::move(answers)) {
        QObject::connect(&mTimer, &QTimer::timeout, [this] { look(); });
        mTimer.start(1);
    }
    ~Answering() { EXPECT_EQ(mNext, mAnswers.size()) << "dialogs were answered"; }

private:
    void look() {
        auto* dialog = qobject_cast<QDialog*>(QApplication::activeModalWidget());
        if (!dialog || dialog == mLast || !dialog->isVisible()) return;
        mLast = dialog;
        if (mNext == mAnswers.size()) {
            ADD_FAILURE() << "a dialog too many: " << dialog->windowTitle().toStdString();
            return dialog->reject();
        }
        mAnswers[mNext++](*dialog);
    }

    const std::vector<std::function<void(QDialog&)>> mAnswers;
    std::size_t mNext = 0;
    QTimer mTimer;
    QPointer<QDialog> mLast;
};

/// One message box.
inline void answering(const std::function<void(QMessageBox&)>& answer,
                      const std::function<void()>& run) {
    const Answering answers({[&](QDialog& dialog) {
        auto* box = qobject_cast<QMessageBox*>(&dialog);
        ASSERT_TRUE(box);
        answer(*box);
    }});
    run();
}

/// Types a file's name into a file dialog and presses Enter.
inline void choose(QDialog& dialog, const QString& path) {
    auto* name = dialog.findChild<QLineEdit*>(QStringLiteral("fileNameEdit"));
    ASSERT_TRUE(name);
    name->setFocus();
    name->selectAll();
    name->insert(path);
    hands::key(*name, Qt::Key_Return, QStringLiteral("\r"));
}

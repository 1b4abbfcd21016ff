#include "frontends/qt/MessageBox.h"

#include <Zandor/platform/Toolkit.h>
#include <Zandor/qt/Text.h>

#include <QApplication>
#include <QMessageBox>
#include <QPointer>
#include <QVariant>

namespace zandor::platform::qt {

void showMessageBox(QWidget* parent, const String& prompt, std::int32_t style, const String& title,
                    const void* owner) {
    if (!qApp || QCoreApplication::closingDown()) return;
    // Not on the stack: its parent may go while it stands open, and takes it along.
    const QPointer<QMessageBox> box = new QMessageBox(parent);
    box->setProperty(ownerProperty, QVariant::fromValue(const_cast<void*>(owner)));
    box->setProperty(promptProperty, toQt(prompt));
    box->setProperty(styleProperty, style);
    box->setTextFormat(Qt::PlainText);
    box->setText(toQt(prompt).replace(QStringLiteral("\r\n"), QStringLiteral("\n")));
    box->setWindowTitle(toQt(title));
    box->setStandardButtons(QMessageBox::Ok);
    if (style & styleExclamation) box->setIcon(QMessageBox::Warning);
    box->setWindowModality(Qt::ApplicationModal);
    if (style & styleSystemModal) box->setWindowFlag(Qt::WindowStaysOnTopHint);
    box->exec();
    delete box;
}

} // namespace zandor::platform::qt

#include "platform/qt/MessageBox.h"

#include "platform/Toolkit.h"
#include "platform/qt/Text.h"

#include <QApplication>
#include <QMessageBox>

namespace platform::qt {

void showMessageBox(QWidget* parent, const String& prompt, std::int32_t style,
                    const String& title) {
    if (!qApp || QCoreApplication::closingDown()) return;
    QMessageBox box(parent);
    box.setProperty(promptProperty, toQt(prompt));
    box.setProperty(styleProperty, style);
    box.setTextFormat(Qt::PlainText);
    box.setText(toQt(prompt).replace(QStringLiteral("\r\n"), QStringLiteral("\n")));
    box.setWindowTitle(toQt(title));
    box.setStandardButtons(QMessageBox::Ok);
    if (style & styleExclamation) box.setIcon(QMessageBox::Warning);
    box.setWindowModality(Qt::ApplicationModal);
    if (style & styleSystemModal) box.setWindowFlag(Qt::WindowStaysOnTopHint);
    box.exec();
}

} // namespace platform::qt

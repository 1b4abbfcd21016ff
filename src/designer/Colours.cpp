#include "designer/Colours.h"

#include <QApplication>
#include <QPalette>
#include <QStyle>

namespace zandor::designer {

namespace {

QString& ownStyle() {
    static QString name;
    return name;
}

} // namespace

void useOwnColours() {
    if (ownStyle().isEmpty()) return; // nothing was changed
    QApplication::setStyle(ownStyle());
    QApplication::setPalette(QPalette());
    ownStyle().clear();
}

bool areDarkColoursUsed() { return !ownStyle().isEmpty(); }

bool areColoursDark() {
    constexpr int middle = 128;
    return QGuiApplication::palette().color(QPalette::Window).lightness() < middle;
}

void useDarkColours() {
    if (ownStyle().isEmpty()) ownStyle() = QApplication::style()->name();
    // Fusion follows the palette in every part; a desktop's own style need not.
    QApplication::setStyle(QStringLiteral("Fusion"));

    const QColor window(0x3a, 0x3d, 0x41);
    const QColor base(0x1f, 0x21, 0x24);
    const QColor text(0xdf, 0xe1, 0xe5);
    const QColor faint(0x8a, 0x8e, 0x95);
    const QColor accent(0x3d, 0x7b, 0xd9);

    QPalette palette(text, window.lighter(120), window.lighter(170), base.darker(130),
                     window.lighter(140), text, Qt::white, base, window);
    palette.setColor(QPalette::AlternateBase, window);
    palette.setColor(QPalette::ToolTipBase, window.lighter(130));
    palette.setColor(QPalette::ToolTipText, text);
    palette.setColor(QPalette::PlaceholderText, faint);
    palette.setColor(QPalette::Highlight, accent);
    palette.setColor(QPalette::HighlightedText, Qt::white);
    palette.setColor(QPalette::Link, accent.lighter(130));
    for (const auto role : {QPalette::WindowText, QPalette::Text, QPalette::ButtonText})
        palette.setColor(QPalette::Disabled, role, faint);
    palette.setColor(QPalette::Disabled, QPalette::Highlight, window.lighter(150));
    palette.setColor(QPalette::Disabled, QPalette::HighlightedText, faint);
    QApplication::setPalette(palette);
}

} // namespace zandor::designer

#include "Screen.h"

#include <stdexcept>

Screen::Screen()
    : mServer(QStringLiteral("Xvfb"),
              {"-displayfd", "1", "-screen", "0", "1366x900x24", "-nolisten", "tcp", "-noreset"}),
      mNumber(mServer.line()) {}

void Screen::click(QPoint at, int button) {
    move(at);
    use({"click", number(button)});
}

void Screen::doubleClick(QPoint at) {
    move(at);
    use({"click", "--repeat", "2", "--delay", "60", "1"});
}

void Screen::use(const QStringList& words) {
    Program hand(QStringLiteral("xdotool"), words, {variable()});
    if (!hand.endsWell())
        throw std::runtime_error("xdotool " + words.join(u' ').toStdString() + " failed");
}

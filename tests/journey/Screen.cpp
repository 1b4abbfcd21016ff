#include "Screen.h"

#include <stdexcept>

Screen::Screen(QSize size)
    : mServer(QStringLiteral("Xvfb"),
              {"-displayfd", "1", "-screen", "0",
               QStringLiteral("%1x%2x24").arg(size.width()).arg(size.height()), "-nolisten", "tcp",
               "-noreset"}),
      mNumber(mServer.line()) {}

bool Screen::shows(const QString& title) {
    return Program(QStringLiteral("xdotool"), {"search", "--onlyvisible", "--name", title},
                   {variable()})
        .endsWell();
}

void Screen::click(QPoint at, int button) {
    move(at);
    ++mEffort.clicks;
    use({"click", number(button)});
}

void Screen::doubleClick(QPoint at) {
    move(at);
    mEffort.clicks += 2;
    use({"click", "--repeat", "2", "--delay", "60", "1"});
}

void Screen::turnWheel(bool away) {
    ++mEffort.turns;
    use({"click", away ? "4" : "5"});
}

void Screen::use(const QStringList& words) {
    Program hand(QStringLiteral("xdotool"), words, {variable()});
    if (!hand.endsWell())
        throw std::runtime_error("xdotool " + words.join(u' ').toStdString() + " failed");
}

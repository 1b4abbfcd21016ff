#pragma once

#include <QObject>
#include <QWidget>

#include <random>

class QAction;

/// A user of a window who clicks, drags, types and chooses at random, also in what opens over it.
/// No file is chosen and the window is not closed.
class RandomHands {
public:
    RandomHands(QWidget& window, unsigned seed);

    /// Does one thing and has the window do what follows from it.
    void act();
    /// Answers whatever stands in the way from now on by the way out that keeps nothing.
    void leave(bool on) { mLeaving = on; }

    int done() const { return mDone; }

private:
    int below(int count) { return std::uniform_int_distribution(0, count - 1)(mEngine); }
    bool chance(int percent) { return below(100) < percent; }
    void lookSoon();
    void look();
    void useMouse(QWidget& in);
    void useKeys(QWidget& in);
    void chooseCommand();
    void chooseIn(QWidget& popup);
    void answer(QWidget& dialog);
    static bool mayBeChosen(const QAction& action);

    QWidget& mWindow;
    std::mt19937 mEngine;
    QObject mLooking; ///< for what opens with a loop of its own, in which `act` is held up
    int mHeldUp = 0;
    int mDone = 0;
    bool mLeaving = false;
};

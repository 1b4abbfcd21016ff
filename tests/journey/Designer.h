#pragma once

#include "Screen.h"

/// The program with the designer's window, on a screen, and what a user does with it. Whatever is
/// pointed at is waited for first.
class Designer {
public:
    /// Starts a program that answers as Host.h says.
    Designer(Screen& screen, const QString& program, const QStringList& arguments,
             const QStringList& environment = {});

    QStringList ask(const QString& question);
    QStringList events() { return ask(QStringLiteral("events")); }
    QStringList query() { return ask(QStringLiteral("query")); }
    bool isShown(const QString& thing) { return !ask("place " + thing).isEmpty(); }

    /// Waits until a thing is shown ("entry orders id"), and gives its place.
    QPoint place(const QString& thing);
    void awaitGone(const QString& thing);
    /// Waits until exactly these events have come since the last call.
    void awaitEvents(const QStringList& wanted);

    void click(const QString& thing) { mScreen.click(place(thing)); }
    /// Opens the menu with the right button and chooses an entry of it.
    void choose(const QString& thing, const QString& command);
    void openMenu(const QString& thing, const QString& command);
    /// Opens a combo box with the mouse and takes an item.
    void pick(const QString& combo, int item, const QString& text);
    void type(const QString& input, const QString& text);
    /// Carries entries of a table to a place without letting go.
    void carry(const QString& thing, const QString& to);
    void drop();

    /// Saves what the window shows as a file of this name, without suffix.
    void picture(const QString& name);
    bool quit();
    /// Whether it has ended by itself, and well.
    bool endsWell() { return mProgram.endsWell(); }
    /// As a power failure would.
    void kill() { mProgram.kill(); }

private:
    Screen& mScreen;
    Program mProgram;
    qsizetype mEventsSeen = 0;
};

#include "Designer.h"

#include <QDir>

#include <stdexcept>

Designer::Designer(Screen& screen, const QString& program, const QStringList& arguments,
                   const QStringList& environment)
    : mScreen(screen), mProgram(program, arguments,
                                QStringList{screen.variable(), "QT_QPA_PLATFORM=xcb",
                                            "QT_SCALE_FACTOR=1", "QT_STYLE_OVERRIDE=fusion"} +
                                    environment) {
    await(QStringLiteral("the window is active"),
          [this] { return !ask(QStringLiteral("active")).isEmpty(); });
}

QStringList Designer::ask(const QString& question) {
    mProgram.send(question);
    QStringList lines;
    for (int left = mProgram.line().toInt(); left > 0; --left) lines += mProgram.line();
    return lines;
}

QPoint Designer::place(const QString& thing) {
    QStringList numbers;
    await(thing + " is shown", [&] {
        const QStringList answer = ask("place " + thing);
        numbers = answer.isEmpty() ? QStringList() : answer.first().split(u' ');
        return numbers.size() == 2;
    });
    return {numbers[0].toInt(), numbers[1].toInt()};
}

void Designer::awaitGone(const QString& thing) {
    await(thing + " is gone", [&] { return !isShown(thing); });
}

void Designer::awaitEvents(const QStringList& wanted) {
    QStringList seen;
    try {
        await(QStringLiteral("events"), [&] {
            seen = events().mid(mEventsSeen);
            return seen == wanted;
        });
    } catch (const std::runtime_error&) {
        throw std::runtime_error(QStringLiteral("expected [%1], and these events came: [%2]")
                                     .arg(wanted.join(u' '), seen.join(u' '))
                                     .toStdString());
    }
    mEventsSeen += seen.size();
}

void Designer::openMenu(const QString& thing, const QString& command) {
    mScreen.click(place(thing), 3);
    mScreen.move(place("menu " + command));
}

void Designer::choose(const QString& thing, const QString& command) {
    openMenu(thing, command);
    click("menu " + command);
    awaitGone("menu " + command);
}

void Designer::pick(const QString& combo, int item, const QString& text) {
    click("control " + combo);
    const QString entry = QStringLiteral("item %1 %2").arg(combo).arg(item);
    await(combo + " reads " + text, [&] {
        // A click that comes very soon counts as part of the one that opened the list.
        if (isShown(entry)) click(entry);
        return ask("text " + combo) == QStringList(text);
    });
    awaitGone(entry);
}

void Designer::type(const QString& input, const QString& text) {
    place("control " + input);
    // Keys that come before the input has the keyboard are lost.
    await(input + " has the keyboard", [&] { return !ask("focused " + input).isEmpty(); });
    mScreen.type(text);
    await(input + " reads " + text, [&] { return ask("text " + input) == QStringList(text); });
}

void Designer::carry(const QString& thing, const QString& to) {
    const QPoint start = place(thing);
    mScreen.move(start);
    mScreen.press(1);
    mScreen.move(start + QPoint(3, 2));
    // Lists of Qt's own want to see it move on.
    mScreen.move(start + QPoint(14, 8));
    mScreen.move(start + QPoint(16, 9));
    await(QStringLiteral("the drag has begun"),
          [this] { return !ask(QStringLiteral("dragged")).isEmpty(); });
    const QPoint end = place(to);
    for (int step = 1; step <= 4; ++step) mScreen.move(start + (end - start) * step / 4);
    const QString there = QStringLiteral("%1 %2").arg(end.x()).arg(end.y());
    await("the drag is over " + to,
          [&] { return ask(QStringLiteral("dragged")) == QStringList(there); });
}

void Designer::drop() {
    mScreen.release(1);
    await(QStringLiteral("the drag is over"),
          [this] { return ask(QStringLiteral("dragged")).isEmpty(); });
}

void Designer::picture(const QString& name) {
    const QDir directory(QStringLiteral(ZANDOR_JOURNEY_PICTURES));
    directory.mkpath(QStringLiteral("."));
    if (ask("picture " + directory.filePath(name + ".png")) != QStringList("1"))
        throw std::runtime_error("no picture " + name.toStdString());
}

bool Designer::quit() {
    mProgram.send(QStringLiteral("quit"));
    mProgram.line();
    return mProgram.endsWell();
}

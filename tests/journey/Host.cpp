#include "Host.h"

#include "Places.h"
#include "QueryText.h"

#include "frontends/qt/ColumnListModel.h"
#include "frontends/qt/GridWidget.h"
#include "frontends/qt/TabuletWidget.h"

#include <QApplication>
#include <QComboBox>
#include <QDialog>
#include <QDrag>
#include <QDropEvent>
#include <QLabel>
#include <QLineEdit>
#include <QPlainTextEdit>
#include <QScreen>
#include <QTableView>

#include <cstdio>
#include <cstdlib>

#include <unistd.h>

using namespace zandor;

namespace {

QString numbers(int one, int other) { return QStringLiteral("%1 %2").arg(one).arg(other); }

/// A line for each row, with " | " between the cells.
QString rowsOf(const QTableView& view) {
    const auto& model = *view.model();
    QStringList lines;
    for (int row = 0; row < model.rowCount(); ++row) {
        QStringList cells;
        for (int column = 0; column < model.columnCount(); ++column)
            cells += model.index(row, column).data().toString();
        lines += cells.join(QStringLiteral(" | "));
    }
    return lines.join(u'\n');
}

} // namespace

Host::Host(QWidget& window, Query query) : mWindow(window), mQuery(std::move(query)) {
    qApp->installEventFilter(this);
    connect(&mInput, &QSocketNotifier::activated, this, [this] { read(); });
}

bool Host::eventFilter(QObject* watched, QEvent* event) {
    if (auto* over = qobject_cast<QWidget*>(watched);
        over && (event->type() == QEvent::DragEnter || event->type() == QEvent::DragMove))
        mDraggedOver = over->mapToGlobal(static_cast<QDropEvent*>(event)->position().toPoint());
    // The share of a window manager, of which there is none.
    if (auto* dialog = qobject_cast<QDialog*>(watched); dialog && event->type() == QEvent::Show)
        dialog->activateWindow();
    if (qobject_cast<QDialog*>(watched) && event->type() == QEvent::Hide) mWindow.activateWindow();
    return QObject::eventFilter(watched, event);
}

void Host::listen(ZandorWidget& control) {
    mControl = &control;
    using Widget = ZandorWidget;
    const auto log = [&](auto signal, const char* name) {
        connect(&control, signal, this, [this, name] { mLog += name; });
    };
    log(&Widget::TableDeleted, "TableDeleted");
    log(&Widget::TableMoved, "TableMoved");
    log(&Widget::Activate, "Activate");
    log(&Widget::ColumnCreated, "ColumnCreated");
    log(&Widget::ColumnModified, "ColumnModified");
    log(&Widget::ColumnRemoved, "ColumnRemoved");
    log(&Widget::Error, "Error");
    log(&Widget::JoinCreated, "JoinCreated");
    log(&Widget::JoinModified, "JoinModified");
    log(&Widget::JoinRemoved, "JoinRemoved");
}

void Host::read() {
    char buffer[4096];
    const ssize_t count = ::read(STDIN_FILENO, buffer, sizeof buffer);
    if (count <= 0) std::_Exit(1); // whoever asks has gone
    mPending.append(buffer, count);
    for (qsizetype end; (end = mPending.indexOf('\n')) >= 0;) {
        const QString question = QString::fromUtf8(mPending.left(end));
        mPending.remove(0, end + 1);
        const QStringList lines = answer(question).split(u'\n', Qt::SkipEmptyParts);
        std::printf("%lld\n", static_cast<long long>(lines.size()));
        for (const QString& line : lines) std::printf("%s\n", qPrintable(line));
        std::fflush(stdout);
    }
}

QString Host::answer(const QString& question) {
    const QStringList words = question.split(u' ');
    const QString& asked = words.value(0);
    if (asked == "events") return mLog.join(u'\n');
    if (asked == "query") return textOf(mQuery());
    if (asked == "place") return onScreen(placeOf(mWindow, words.mid(1)));
    if (asked == "dragged") {
        // Where the drag that is on was seen last.
        if (!mWindow.findChild<QDrag*>()) return {};
        return mDraggedOver ? onScreen(mDraggedOver) : QStringLiteral("nowhere");
    }
    if (asked == "focus") return focusedName();
    if (asked == "cell") return currentCell();
    if (asked == "scrolls" && mControl)
        return numbers(mControl->HorizMaxScrollPos(), mControl->VertMaxScrollPos());
    if (asked == "selected") return selected(words.value(1));
    if (asked == "text") return shownText(words.value(1));
    if (asked == "focused") return isFocused(words.value(1)) ? QStringLiteral("yes") : QString();
    if (asked == "active") return QApplication::activeWindow() ? QStringLiteral("yes") : QString();
    if (asked == "picture") return QString::number(savePicture(question.mid(8)));
    if (asked == "quit") QApplication::quit();
    return {};
}

/// The mouse counts the screen's own pixels.
QString Host::onScreen(const std::optional<QPoint>& place) const {
    if (!place) return {};
    const QPoint at = (QPointF(*place) * mWindow.devicePixelRatio()).toPoint();
    return numbers(at.x(), at.y());
}

QString Host::focusedName() {
    const QWidget* at = QApplication::focusWidget();
    while (at && (at->objectName().isEmpty() || at->objectName().startsWith(u"qt_")))
        at = at->parentWidget();
    return at ? at->objectName() : QString();
}

QString Host::currentCell() const {
    const auto* grid = dynamic_cast<platform::qt::GridWidget*>(
        mControl ? mControl->findChild<QWidget*>(QStringLiteral("sprColumn")) : nullptr);
    if (!grid) return {};
    return numbers(grid->currentRow(), grid->currentCol());
}

bool Host::isFocused(const QString& name) {
    const QWidget* const control = shownControl(mWindow, name);
    const QWidget* const focus =
        QApplication::activeWindow() ? QApplication::focusWidget() : nullptr;
    return control && focus && (focus == control || control->isAncestorOf(focus));
}

QString Host::selected(const QString& title) {
    QStringList names;
    for (auto* child : mWindow.findChildren<QWidget*>())
        if (auto* table = dynamic_cast<platform::qt::TabuletWidget*>(child);
            table && table->title() == title)
            for (int row = 0; row < table->model().rowCount(); ++row)
                if (table->list().selectionModel()->isRowSelected(row))
                    names += table->model().text(row);
    return names.join(u'\n');
}

QString Host::shownText(const QString& name) {
    QWidget* const control = shownControl(mWindow, name);
    if (const auto* input = qobject_cast<QLineEdit*>(control)) return input->text();
    if (const auto* combo = qobject_cast<QComboBox*>(control)) return combo->currentText();
    if (const auto* label = qobject_cast<QLabel*>(control)) return label->text();
    if (const auto* edit = qobject_cast<QPlainTextEdit*>(control)) return edit->toPlainText();
    if (const auto* view = qobject_cast<QTableView*>(control)) return rowsOf(*view);
    if (control && control->isWindow()) return control->windowTitle();
    return {};
}

bool Host::savePicture(const QString& file) {
    const QRect window = mWindow.geometry();
    return QGuiApplication::primaryScreen()
        ->grabWindow(0, window.x(), window.y(), window.width(), window.height())
        .save(file);
}

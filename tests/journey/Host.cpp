#include "Places.h"
#include "QueryText.h"

#include "model/Library.h"
#include "model/reader/Connection.h"
#include "model/reader/addTables.h"
#include "platform/qt/ColumnListModel.h"
#include "platform/qt/DragSession.h"
#include "platform/qt/QtToolkit.h"
#include "platform/qt/TabuletWidget.h"
#include "platform/qt/ZandorWidget.h"

#include <QApplication>
#include <QComboBox>
#include <QDialog>
#include <QDropEvent>
#include <QLineEdit>
#include <QScreen>
#include <QSocketNotifier>

#include <cstdio>
#include <cstdlib>

#include <unistd.h>

// A window with the designer on it. Questions come in on the standard input, a line each; every
// one is answered on the standard output with as many lines as the answer's first line says.

namespace {

constexpr QSize windowSize(1240, 800);

/// The sample's tables as they stand when the journey begins, in twips.
struct Start {
    platform::StringView table;
    float left, top, width, height;
};

constexpr Start tables[] = {{u"suppliers", 450, 300, 2550, 2250},
                            {u"customers", 5250, 300, 2850, 3450},
                            {u"orders", 9900, 300, 2550, 2850},
                            {u"order_lines", 14100, 300, 2550, 2550}};

class Host : public QObject {
public:
    Host(ZandorWidget& widget, model::Query& query) : mWidget(widget), mQuery(query) {
        listen();
        qApp->installEventFilter(this);
        connect(&mInput, &QSocketNotifier::activated, this, [this] { read(); });
    }

    bool eventFilter(QObject* watched, QEvent* event) override {
        if (auto* over = qobject_cast<QWidget*>(watched);
            over && (event->type() == QEvent::DragEnter || event->type() == QEvent::DragMove))
            mDraggedOver = over->mapToGlobal(static_cast<QDropEvent*>(event)->position().toPoint());
        // The share of a window manager, of which there is none.
        if (auto* dialog = qobject_cast<QDialog*>(watched); dialog && event->type() == QEvent::Show)
            dialog->activateWindow();
        return QObject::eventFilter(watched, event);
    }

private:
    void listen() {
        using Widget = ZandorWidget;
        const auto log = [this](auto signal, const char* name) {
            connect(&mWidget, signal, this, [this, name] { mLog += name; });
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

    void read() {
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

    QString answer(const QString& question) {
        const QStringList words = question.split(u' ');
        const QString& asked = words.value(0);
        if (asked == "events") return mLog.join(u'\n');
        if (asked == "query") return textOf(mQuery);
        if (asked == "place") return text(placeOf(mWidget, words.mid(1)));
        if (asked == "dragged") {
            // Where the drag that is on was seen last.
            if (!mWidget.toolkit().drags().source()) return {};
            return mDraggedOver ? text(mDraggedOver) : QStringLiteral("nowhere");
        }
        if (asked == "selected") return selected(words.value(1));
        if (asked == "text") return shownText(words.value(1));
        if (asked == "active") return QString::fromLatin1(mWidget.isActiveWindow() ? "yes" : "");
        if (asked == "picture") {
            const QRect window = mWidget.geometry();
            return QString::number(
                QGuiApplication::primaryScreen()
                    ->grabWindow(0, window.x(), window.y(), window.width(), window.height())
                    .save(question.mid(8)));
        }
        if (asked == "quit") QApplication::quit();
        return {};
    }

    static QString text(const std::optional<QPoint>& place) {
        return place ? QStringLiteral("%1 %2").arg(place->x()).arg(place->y()) : QString();
    }

    QString selected(const QString& title) {
        QStringList names;
        for (auto* child : mWidget.findChildren<QWidget*>())
            if (auto* table = dynamic_cast<platform::qt::TabuletWidget*>(child);
                table && table->title() == title)
                for (int row = 0; row < table->model().rowCount(); ++row)
                    if (table->list().selectionModel()->isRowSelected(row))
                        names += table->model().text(row);
        return names.join(u'\n');
    }

    QString shownText(const QString& name) {
        QWidget* const control = shownControl(mWidget, name);
        if (const auto* input = qobject_cast<QLineEdit*>(control)) return input->text();
        if (const auto* combo = qobject_cast<QComboBox*>(control)) return combo->currentText();
        return {};
    }

    ZandorWidget& mWidget;
    model::Query& mQuery;
    QSocketNotifier mInput{STDIN_FILENO, QSocketNotifier::Read};
    QByteArray mPending;
    QStringList mLog;
    std::optional<QPoint> mDraggedOver;
};

platform::Ref<model::Query> makeQuery(const QString& file) {
    const auto database = reader::openSqlite(file);
    if (!database) qFatal("%s", qPrintable(database.error()));
    const auto schema = reader::makeSqliteReader(database->database());
    std::vector<reader::TableId> names;
    for (const Start& start : tables) names.push_back({{}, platform::String(start.table)});
    const auto query = platform::makeRef<model::Query>();
    const auto added = reader::addTables(*query, *schema, names, windowSize.width() * 15);
    if (!added) qFatal("%s", qPrintable(added.error()));
    for (const Start& start : tables) {
        const auto table = query->tableNamed(start.table);
        table->Left(start.left);
        table->Top(start.top);
        table->Width(start.width);
        table->Height(start.height);
    }
    return query;
}

} // namespace

int main(int argc, char** argv) {
    const QApplication application(argc, argv);
    const auto query = makeQuery(QString::fromLocal8Bit(argc > 1 ? argv[1] : "trading.sqlite"));
    model::Library library;
    ZandorWidget widget(library);
    widget.setDebugSwitch(0);
    widget.setOnlyJoin(false);
    widget.setJoinModifyDisabled(1); // lets joins be modified
    widget.setMXHorzFrameSize(windowSize.width() * 15);
    widget.setModel(query);
    widget.setWindowTitle(QStringLiteral("Journey"));
    widget.setGeometry(QRect(QPoint(60, 40), windowSize));
    const Host host(widget, *query);
    widget.show();
    widget.activateWindow();
    return QApplication::exec();
}

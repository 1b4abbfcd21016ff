#include "frontends/qt/CanvasAccessible.h"

#include "frontends/qt/Canvas.h"
#include "frontends/qt/CanvasItems.h"
#include "frontends/qt/CanvasView.h"
#include "frontends/qt/PaneHandle.h"
#include "frontends/qt/ShownText.h"
#include "frontends/qt/TabuletWidget.h"

#include <Zandor/qt/Text.h>
#include <Zandor/qt/Twips.h>

#include <QAccessibleWidget>
#include <QWindow>

#include <algorithm>

namespace zandor::platform::qt {

namespace {

class LineAccessible final : public QAccessibleInterface, public QAccessibleActionInterface {
public:
    LineAccessible(CanvasLine& line, Canvas& canvas) : mLine(line), mCanvas(canvas) {}

    bool isValid() const override { return true; }
    QObject* object() const override { return nullptr; }
    QWindow* window() const override { return mCanvas.window()->windowHandle(); }
    QAccessibleInterface* parent() const override {
        return QAccessible::queryAccessibleInterface(&mCanvas);
    }
    QAccessibleInterface* childAt(int, int) const override { return nullptr; }
    QAccessibleInterface* child(int) const override { return nullptr; }
    int childCount() const override { return 0; }
    int indexOfChild(const QAccessibleInterface*) const override { return -1; }

    QString text(QAccessible::Text kind) const override {
        if (kind == QAccessible::Description) return asSigns(toQt(mLine.notes().Sentence));
        return kind == QAccessible::Name ? mCanvas.view().nameOf(mLine) : QString();
    }
    void setText(QAccessible::Text, const QString&) override {}
    QAccessible::Role role() const override { return QAccessible::Graphic; }
    QRect rect() const override {
        const QRect place = mLine.extent().boundingRect();
        return {mCanvas.mapToGlobal(place.topLeft()), place.size()};
    }
    QAccessible::State state() const override {
        QAccessible::State state;
        state.focusable = true;
        state.focused = mCanvas.hasFocus() && mCanvas.currentLine() == &mLine;
        state.offscreen = !mCanvas.view().seen().intersects(mLine.extent().boundingRect());
        return state;
    }

    void* interface_cast(QAccessible::InterfaceType type) override {
        return type == QAccessible::ActionInterface ? static_cast<QAccessibleActionInterface*>(this)
                                                    : nullptr;
    }
    QStringList actionNames() const override { return {setFocusAction(), pressAction()}; }
    QStringList keyBindingsForAction(const QString&) const override { return {}; }
    void doAction(const QString& name) override {
        if (name != setFocusAction() && name != pressAction()) return;
        mCanvas.focusOn(&mLine, Qt::OtherFocusReason);
        if (name == pressAction()) mCanvas.openCurrentLine();
    }

private:
    CanvasLine& mLine;
    Canvas& mCanvas;
};

/// The children of the canvas are its tables and then its lines.
class CanvasAccessible final : public QAccessibleWidget {
public:
    explicit CanvasAccessible(Canvas& canvas) : QAccessibleWidget(&canvas, QAccessible::Canvas) {}

    int childCount() const override {
        return static_cast<int>(canvas().tables().size() + canvas().lines().size());
    }

    QAccessibleInterface* child(int index) const override {
        const auto tables = canvas().tables();
        const auto lines = canvas().lines();
        const int first = static_cast<int>(tables.size());
        if (index < 0 || index >= first + static_cast<int>(lines.size())) return nullptr;
        return index < first
                   ? QAccessible::queryAccessibleInterface(tables[static_cast<std::size_t>(index)])
                   : lines[static_cast<std::size_t>(index - first)]->accessible();
    }

    int indexOfChild(const QAccessibleInterface* wanted) const override {
        for (int index = 0; index < childCount(); ++index)
            if (child(index) == wanted) return index;
        return -1;
    }

    QAccessibleInterface* childAt(int x, int y) const override {
        if (auto* box = QAccessibleWidget::childAt(x, y)) return box;
        const QPoint at = canvas().mapFromGlobal(QPoint(x, y));
        constexpr double reach = 50;
        for (CanvasLine* line : canvas().lines())
            if (line->distanceTo(QPointF(at) * twipsPerPixel) < reach) return line->accessible();
        return nullptr;
    }

    QAccessibleInterface* focusChild() const override {
        if (canvas().hasFocus() && canvas().currentLine())
            return canvas().currentLine()->accessible();
        return QAccessibleWidget::focusChild();
    }

private:
    Canvas& canvas() const { return *static_cast<Canvas*>(widget()); }
};

/// Who reads a table finds its list and its button, which are made for that.
class TabuletAccessible final : public QAccessibleWidget {
public:
    explicit TabuletAccessible(TabuletWidget& box)
        : QAccessibleWidget(&box, QAccessible::Window), mBox(box) {}

    int childCount() const override {
        mBox.list();
        return QAccessibleWidget::childCount();
    }
    QAccessibleInterface* child(int index) const override {
        mBox.list();
        return QAccessibleWidget::child(index);
    }
    QAccessibleInterface* childAt(int x, int y) const override {
        mBox.list();
        return QAccessibleWidget::childAt(x, y);
    }

private:
    TabuletWidget& mBox;
};

QAccessibleInterface* make(const QString& className, QObject* object) {
    if (className == QLatin1String(Canvas::staticMetaObject.className()))
        return new CanvasAccessible(*static_cast<Canvas*>(object));
    if (className == QLatin1String(TabuletWidget::staticMetaObject.className()))
        return new TabuletAccessible(*static_cast<TabuletWidget*>(object));
    if (className == QLatin1String(PaneHandle::staticMetaObject.className()))
        return new QAccessibleWidget(static_cast<QWidget*>(object), QAccessible::Splitter);
    if (className == QLatin1String("ZandorWidget"))
        return new QAccessibleWidget(static_cast<QWidget*>(object), QAccessible::Grouping);
    return nullptr;
}

} // namespace

QAccessibleInterface* makeAccessible(CanvasLine& line, Canvas& canvas) {
    return new LineAccessible(line, canvas);
}

void installAccessibleObjects() { QAccessible::installFactory(make); }

} // namespace zandor::platform::qt

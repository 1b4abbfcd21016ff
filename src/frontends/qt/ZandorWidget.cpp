#include <Zandor/ZandorWidget.h>

#include "frontends/qt/Canvas.h"
#include "frontends/qt/CanvasItems.h"
#include "frontends/qt/GridWidget.h"
#include "frontends/qt/JoinName.h"
#include "frontends/qt/LaterLibrary.h"
#include "frontends/qt/PaneHandle.h"
#include "frontends/qt/QtToolkit.h"
#include "frontends/qt/ShownText.h"
#include "frontends/qt/TabuletWidget.h"
#include "frontends/qt/translatedWords.h"

#include <Zandor/platform/Numbers.h>
#include <Zandor/qt/Text.h>
#include <Zandor/qt/Twips.h>

#include <QKeyEvent>
#include <QPaintEvent>
#include <QPointer>
#include <QWheelEvent>

#include <optional>

using namespace zandor;

using platform::qt::fromQt;
using platform::qt::toQt;
using TalvikDBxZandor::Zandor;

/// Turns the control's events into the widget's signals.
class ZandorWidget::Events : public TalvikDBxZandor::ZandorEvents {
public:
    explicit Events(ZandorWidget& widget) : mWidget(widget) {}

    void Raise(TalvikDBxZandor::Event event,
               const TalvikDBxZandor::EventArguments& arguments) override {
        using TalvikDBxZandor::Event;
        if (!mWidget.mToolkit->comforts().raised(event, arguments)) return;
        switch (event) {
        case Event::TableDeleted: Q_EMIT mWidget.TableDeleted(); break;
        case Event::TableMoved: Q_EMIT mWidget.TableMoved(); break;
        case Event::Activate: Q_EMIT mWidget.Activate(); break;
        case Event::ColumnCreated: Q_EMIT mWidget.ColumnCreated(arguments.Definition); break;
        case Event::ColumnModified: Q_EMIT mWidget.ColumnModified(arguments.Definition); break;
        case Event::ColumnRemoved: Q_EMIT mWidget.ColumnRemoved(arguments.Definition); break;
        case Event::Error: Q_EMIT mWidget.Error(toQt(arguments.Text), arguments.Number); break;
        case Event::JoinCreated: Q_EMIT mWidget.JoinCreated(arguments.Join); break;
        case Event::JoinModified: Q_EMIT mWidget.JoinModified(arguments.Join); break;
        case Event::JoinRemoved: Q_EMIT mWidget.JoinRemoved(arguments.Join); break;
        }
    }

private:
    ZandorWidget& mWidget;
};

/// What the control stands on. When the widget goes while something of it is further down the
/// stack, the house takes in the widget's children, whose handlers may be there too, and goes
/// itself when control is back in the event loop that called them.
class ZandorWidget::House : public QObject {
public:
    explicit House(ZandorWidget& widget) : toolkit(widget), events(widget) {}

    static std::shared_ptr<House> build(ZandorWidget& widget) {
        return {new House(widget), [](House* house) {
                    if (house->mChildren)
                        house->deleteLater();
                    else
                        delete house;
                }};
    }

    void takeIn(const QWidget& widget) {
        mChildren = std::make_unique<QWidget>();
        // A copy, for whoever gets another parent leaves the list.
        // NOLINTNEXTLINE(performance-unnecessary-copy-initialization)
        const QObjectList children = widget.children();
        for (QObject* child : children)
            if (auto* part = qobject_cast<QWidget*>(child)) part->setParent(mChildren.get());
    }

private:
    std::unique_ptr<QWidget> mChildren; // goes last

public:
    platform::qt::QtToolkit toolkit;
    platform::qt::LaterLibrary library;
    Events events;
    std::optional<Zandor> control;
};

ZandorWidget::ZandorWidget(TalvikZandorLib::Library& library, QWidget* parent)
    : ZandorWidget(parent) {
    mHouse->library.set(library);
}

ZandorWidget::ZandorWidget(QWidget* parent)
    : QWidget(parent), mHouse(House::build(*this)), mToolkit(&mHouse->toolkit) {
    // The canvas has the same background, so that none sees where it ends.
    setAutoFillBackground(true);
    setBackgroundRole(QPalette::Window);
    setFocusPolicy(Qt::TabFocus);
    resize(ZandorWidget::sizeHint());
    mToolkit->drags().setKeeper(mHouse);
    mHouse->control.emplace(*mToolkit, mHouse->library, mHouse->events, mHouse);
    mControl = &*mHouse->control;
    mToolkit->comforts().attach(*mControl);
    mToolkit->view().setNamer([this](const platform::qt::CanvasLine& line) {
        return mControl ? joinName(*mControl, line.ends()) : QString();
    });
    resetWords();
    mToolkit->comforts().RenameRequested = [this](const platform::String& key) {
        QMetaObject::invokeMethod(
            this, [this, name = toQt(key)] { Q_EMIT renameRequested(name); }, Qt::QueuedConnection);
    };
    mToolkit->grid()->handle().setMover([this](int down) { moveDivider(down); });
    mControl->UserControl_Resize();
}

void ZandorWidget::setQuestions(std::shared_ptr<TalvikDBxZandor::Questions> questions) {
    mControl->Ask(std::move(questions));
}

bool ZandorWidget::isReadOnly() const { return mControl->ReadOnly(); }

void ZandorWidget::setReadOnly(bool readOnly) { mControl->ReadOnly(readOnly); }

QPointF ZandorWidget::toCanvas(QPointF place) const {
    const QPointF onCanvas = place - canvasOrigin();
    return {platform::qt::toTwips(onCanvas.x()), platform::qt::toTwips(onCanvas.y())};
}

QPoint ZandorWidget::fromCanvas(QPointF twips) const {
    return canvasOrigin() + QPoint(platform::qt::toPixels(static_cast<float>(twips.x())),
                                   platform::qt::toPixels(static_cast<float>(twips.y())));
}

/// Where the canvas begins in this widget, by how far it is scrolled.
QPoint ZandorWidget::canvasOrigin() const {
    return mToolkit->view().canvas()->mapTo(this, QPoint());
}

void ZandorWidget::setLibrary(TalvikZandorLib::Library& library) {
    mHouse->library.set(library);
    // Of a form, what can be translated is set last of all, behind OnlyJoin, which reads titles.
    mControl->OnlyJoin(mControl->OnlyJoin());
}

void ZandorWidget::setSilent(bool silent) { mToolkit->setSilent(silent); }

double ZandorWidget::upperPaneShare() const { return mControl->UpperPaneShare(); }

void ZandorWidget::setUpperPaneShare(double share) {
    // An open editor would stay where its cell was.
    mControl->UserControl_Paint();
    mControl->UpperPaneShare(static_cast<float>(share));
}

void ZandorWidget::moveDivider(int down) {
    // Both panes stay large enough to be worked in: a table above, the first rows below.
    constexpr int above = 120;
    const platform::qt::GridWidget& grid = *mToolkit->grid();
    const int below = platform::qt::PaneHandle::thickness + 5 * grid.rowHeight();
    if (height() < above + below) return;
    const int top = std::clamp(grid.y() + down, above, height() - below);
    if (top == grid.y()) return;
    const double share = static_cast<double>(top) / height();
    setUpperPaneShare(share);
    Q_EMIT upperPaneShareChanged(share);
}

const platform::Words& ZandorWidget::words() const { return mToolkit->words(); }

void ZandorWidget::setWords(const platform::Words& words) {
    mOwnWords = true;
    say(words);
}

void ZandorWidget::resetWords() {
    mOwnWords = false;
    say(platform::qt::translatedWords());
}

void ZandorWidget::say(const platform::Words& words) {
    mToolkit->setWords(words);
    mControl->Words(words);
    mToolkit->comforts().setWords(words);
}

ZandorWidget::~ZandorWidget() {
    // The window around may be in the middle of its own destruction.
    mToolkit->close();
    for (auto* const part : findChildren<QWidget*>())
        if (auto* const grid = dynamic_cast<platform::qt::GridWidget*>(part)) grid->end();
    mToolkit->comforts().detach();
    mControl->End();
    mControl = nullptr;
    mToolkit->dismiss();
    if (mHouse.use_count() > 1) mHouse->takeIn(*this);
}

const comforts::Flags& ZandorWidget::comforts() const { return mToolkit->comforts().flags(); }

void ZandorWidget::setComforts(const comforts::Flags& flags) {
    mToolkit->comforts().setFlags(flags);
    mToolkit->grid()->showHandle(flags.MovesPanes);
}

void ZandorWidget::setFindings(std::vector<comforts::Finding> findings) {
    mToolkit->comforts().setFindings(std::move(findings));
}

bool ZandorWidget::showCell(const QString& definition, int row) {
    return mToolkit->comforts().showCell(fromQt(definition), row);
}

void ZandorWidget::takeOver() {
    mToolkit->finishComposing();
    mToolkit->comforts().takeOver();
}

bool ZandorWidget::writeTyping(const ZandorModel& copy) {
    return mToolkit->comforts().writeTyping(copy);
}

void ZandorWidget::setTableNotes(const QMap<QString, QString>& notes) {
    QMap<QString, QString> byTitle;
    for (auto note = notes.begin(); note != notes.end(); ++note)
        byTitle[platform::qt::asSigns(note.key())] = note.value();
    for (auto* const box : findChildren<platform::qt::TabuletWidget*>())
        box->setNote(byTitle.value(box->title()));
}

void ZandorWidget::showAnew() {
    const QPointer<ZandorWidget> alive = this;
    mControl->ShowAnew();
    // A part that goes with the keyboard's focus passes it on within the widget.
    if (alive) mToolkit->grid()->offerAnew();
}

QSize ZandorWidget::sizeHint() const { return {900, 600}; }

QSize ZandorWidget::minimumSizeHint() const { return {240, 160}; }

void ZandorWidget::paintEvent(QPaintEvent* event) {
    // Qt's own paint events come whenever a part of the surface is uncovered: a table that moves,
    // the canvas that scrolls, an editor that opens. What a host sends is a wish of its own.
    if (!event->spontaneous()) queuePaint();
}

void ZandorWidget::update() {
    QWidget::update();
    queuePaint();
}

void ZandorWidget::repaint() {
    QWidget::repaint();
    queuePaint();
}

void ZandorWidget::resizeEvent(QResizeEvent*) {
    if (!mControl) return;
    mControl->UserControl_Resize();
    // An editor that does not go with its cell would be left where that was.
    if (!comforts().KeepsTyping) queuePaint();
}

void ZandorWidget::showEvent(QShowEvent*) { queuePaint(); }

void ZandorWidget::wheelEvent(QWheelEvent* event) { mToolkit->view().scrollByWheel(*event); }

bool ZandorWidget::event(QEvent* event) {
    if (event->type() == QEvent::ShortcutOverride &&
        mToolkit->navigation().claims(static_cast<QKeyEvent&>(*event))) {
        event->accept();
        return true;
    }
    return QWidget::event(event);
}

bool ZandorWidget::focusNextPrevChild(bool next) { return mToolkit->navigation().goOn(next); }

void ZandorWidget::focusInEvent(QFocusEvent* event) {
    if (event->reason() == Qt::TabFocusReason) mToolkit->navigation().enter(true);
    if (event->reason() == Qt::BacktabFocusReason) mToolkit->navigation().enter(false);
}

void ZandorWidget::keyPressEvent(QKeyEvent* event) {
    const QPointer<ZandorWidget> alive = this;
    const bool used = mToolkit->navigation().keyPressed(*event);
    if (alive && !used) QWidget::keyPressEvent(event);
}

void ZandorWidget::changeEvent(QEvent* event) {
    QWidget::changeEvent(event);
    if (event->type() == QEvent::LanguageChange && mControl && !mOwnWords) resetWords();
    if (event->type() != QEvent::StyleChange && event->type() != QEvent::FontChange) return;
    // Its bars may be of another thickness once they have the new style, too, and cells elsewhere.
    QMetaObject::invokeMethod(
        this,
        [this] {
            if (mControl) mControl->UserControl_Resize();
        },
        Qt::QueuedConnection);
}

void ZandorWidget::queuePaint() {
    // The control's paint may open message boxes, which must never happen while Qt paints.
    if (std::exchange(mPaintQueued, true)) return;
    QMetaObject::invokeMethod(
        this,
        [this] {
            mPaintQueued = false;
            if (mControl) mControl->UserControl_Paint();
        },
        Qt::QueuedConnection);
}

void ZandorWidget::setInteger(platform::StringView procedure, int value,
                              void (*set)(Zandor&, std::int16_t)) {
    TalvikDBxZandor::basZandor::Guard(*mToolkit, Zandor::ModuleName, procedure,
                                      [&] { set(*mControl, platform::toInteger(value)); });
}

// The properties of the table: one line a getter, one line a setter.

#define FIELD_TEXT(name)                                                                           \
    QString ZandorWidget::name() const { return toQt(mControl->name); }                            \
    void ZandorWidget::set##name(const QString& value) { mControl->name = fromQt(value); }
#define FIELD_FLAG(name)                                                                           \
    bool ZandorWidget::name() const { return mControl->name; }                                     \
    void ZandorWidget::set##name(bool value) { mControl->name = value; }
#define FIELD_NUMBER(name)                                                                         \
    int ZandorWidget::name() const { return mControl->name; }                                      \
    void ZandorWidget::set##name(int value) {                                                      \
        setInteger(u"P_LET " #name, value,                                                         \
                   [](Zandor& zandor, std::int16_t v) { zandor.name = v; });                       \
    }
#define PROPERTY_FLAG(name)                                                                        \
    bool ZandorWidget::name() const { return mControl->name(); }                                   \
    void ZandorWidget::set##name(bool value) { mControl->name(value); }
#define PROPERTY_NUMBER(name)                                                                      \
    int ZandorWidget::name() const { return mControl->name(); }                                    \
    void ZandorWidget::set##name(int value) {                                                      \
        setInteger(u"P_LET " #name, value,                                                         \
                   [](Zandor& zandor, std::int16_t v) { zandor.name(v); });                        \
    }

ZANDOR_WIDGET_PROPERTIES(FIELD_TEXT, FIELD_FLAG, FIELD_NUMBER, PROPERTY_FLAG, PROPERTY_NUMBER)

ZandorWidget::ZandorModel ZandorWidget::model() const { return mControl->P_GET_Zandor(); }
void ZandorWidget::setModel(const ZandorModel& model) { mControl->P_SET_Zandor(model); }
ZandorWidget::ZDJoin ZandorWidget::lastjoin() const { return mControl->lastjoin(); }
ZandorWidget::ZDTable ZandorWidget::activetable() const { return mControl->activetable(); }
ZandorWidget::ZDColumn ZandorWidget::ActiveColumn() const { return mControl->ActiveColumn(); }

void ZandorWidget::Terminate() { mControl->Terminate(); }

void ZandorWidget::SelectColumnNames(const QString& TabName, const QString& ColName) {
    mControl->SelectColumnNames(fromQt(TabName), fromQt(ColName));
}

void ZandorWidget::SetCurrentTable(const QString& TabName) {
    mControl->SetCurrentTable(fromQt(TabName));
}

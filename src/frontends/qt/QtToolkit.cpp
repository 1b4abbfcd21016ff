#include "frontends/qt/QtToolkit.h"

#include "frontends/qt/CanvasAccessible.h"
#include "frontends/qt/CanvasItems.h"
#include "frontends/qt/CanvasWindow.h"
#include "frontends/qt/Dialog.h"
#include "frontends/qt/EditorWatch.h"
#include "frontends/qt/Fonts.h"
#include "frontends/qt/Frames.h"
#include "frontends/qt/GridAdapter.h"
#include "frontends/qt/GridModel.h"
#include "frontends/qt/HomeButton.h"
#include "frontends/qt/Images.h"
#include "frontends/qt/Inputs.h"
#include "frontends/qt/JoinSentence.h"
#include "frontends/qt/MessageBox.h"
#include "frontends/qt/PickListWidget.h"
#include "frontends/qt/PopupMenu.h"
#include "frontends/qt/ScrollBar.h"
#include "frontends/qt/ZandorWindowMessage.h"

#include <Zandor/platform/RuntimeError.h>
#include <Zandor/qt/Text.h>

#include <QApplication>
#include <QFontMetricsF>
#include <QInputMethod>
#include <QPushButton>

namespace zandor::platform::qt {

namespace {

WidgetHolder* holderOf(const Design& design) {
    if (!design.Container) return nullptr;
    auto* holder = dynamic_cast<WidgetHolder*>(design.Container);
    if (!holder || !holder->widget()) throw errors::invalidProcedureCall();
    return holder;
}

Canvas& canvasOf(const Design& design) {
    WidgetHolder* holder = holderOf(design);
    auto* canvas = holder ? dynamic_cast<Canvas*>(holder->widget()) : nullptr;
    if (!canvas) throw errors::invalidProcedureCall();
    return *canvas;
}

} // namespace

QtToolkit::QtToolkit(QWidget& surface) : mSurface(surface), mFocus(surface) {
    installAccessibleObjects();
}

QWidget* QtToolkit::parentOf(const Design& design) const {
    WidgetHolder* holder = holderOf(design);
    return holder ? holder->widget() : &mSurface;
}

void QtToolkit::finishComposing() const {
    QGuiApplication::inputMethod()->commit();
    if (grid()) grid()->breakOffComposing();
}

GridWidget* QtToolkit::grid() const { return static_cast<GridWidget*>(mGrid.data()); }

QWidget* QtToolkit::window() const { return mClosing ? nullptr : mSurface.window(); }

template <class AdapterType, class W, class... Arguments>
std::unique_ptr<AdapterType> QtToolkit::adapt(const Design& design, Role role, W* widget,
                                              Arguments&&... arguments) {
    widget->setObjectName(toQt(design.Name));
    // Places are counted from the left, whichever way the host's texts run.
    if (!design.Container) widget->setLayoutDirection(Qt::LeftToRight);
    // Within the control, Tab goes the way of the navigation; to the window it is a single stop.
    if (mSurface.isAncestorOf(widget) && widget->focusPolicy() & Qt::TabFocus)
        widget->setFocusPolicy(Qt::ClickFocus);
    auto adapter =
        std::make_unique<AdapterType>(widget, mFocus, std::forward<Arguments>(arguments)...);
    if (WidgetHolder* holder = holderOf(design)) holder->place(widget, role);
    return adapter;
}

void QtToolkit::setWords(const Words& words) {
    const QString before = toQt(mWords.Designer);
    mWords = words;
    const auto name = [&](const char* part, const String& word) {
        auto* const widget = mSurface.findChild<QWidget*>(QLatin1String(part));
        if (widget) widget->setAccessibleName(toQt(word));
        return widget;
    };
    // A name that the host has given stays.
    if (mSurface.accessibleName().isEmpty() || mSurface.accessibleName() == before)
        mSurface.setAccessibleName(toQt(words.Designer));
    name("fraTable", words.Canvas);
    name("hsbTable", words.ScrollAcross);
    name("vsbTable", words.ScrollDown);
    if (QWidget* const home = name("cmdHome", words.Home)) home->setToolTip(home->accessibleName());
    if (grid()) grid()->setWords(words);
    for (auto* const box : mSurface.findChildren<TabuletWidget*>()) box->setWords(words);
    for (auto* const list : mSurface.findChildren<QFrame*>())
        if (auto* const fields = dynamic_cast<PickListWidget*>(list)) fields->setWords(words);
}

void QtToolkit::dismiss() {
    mDrags.cancel();
    mView.setNamer({});
    // What is open closes from the top down; none of it tells the control anything any more.
    for (QWidget* window : QApplication::topLevelWidgets())
        if (window->property(ownerProperty).value<void*>() == this) window->close();
}

void QtToolkit::MsgBox(const String& prompt, std::int32_t style, const String& title) {
    if (mSilent) return;
    QWidget* const parent = window();
    showMessageBox(parent && parent->isVisible() ? parent : nullptr, prompt, style, title, this);
}

std::unique_ptr<Frame> QtToolkit::makeFrame(const Design& design, FrameEvents events) {
    // Only the drawing surface listens to the mouse; other frames hold an editor's parts.
    if (events.MouseDown || events.MouseUp) {
        auto* const window = new CanvasWindow(parentOf(design));
        window->show();
        auto* const canvas = new Canvas(mView, window);
        canvas->show();
        mView.setCanvas(canvas, window);
        return adapt<CanvasAdapter>(design, Role::frame, canvas, std::move(events));
    }
    auto* frame = new RowFrame(parentOf(design), !design.Container);
    if (!design.Container)
        frame->setTitle([this] {
            const auto* grid = static_cast<const GridWidget*>(mGrid.data());
            return grid ? grid->model().titleOf(grid->currentRow(), grid->currentCol()) : QString();
        });
    if (!design.Container)
        new EditorWatch(*frame, [this] {
            finishComposing();
            mComforts.editorLeft();
        });
    return adapt<RowFrameAdapter>(design, Role::frame, frame);
}

std::unique_ptr<CommandButton> QtToolkit::makeCommandButton(const Design& design,
                                                            CommandButtonEvents events) {
    QAbstractButton* button = nullptr;
    if (auto* dialog = qobject_cast<QDialog*>(design.Container ? parentOf(design) : nullptr))
        button = new QPushButton(dialog);
    else if (design.Container)
        button = new SetButton(parentOf(design));
    else
        mNavigation.setHomeButton(button = new HomeButton(parentOf(design)));
    button->setText(toQt(design.Caption));
    button->show();
    return adapt<ButtonAdapter>(design, Role::button, button, std::move(events));
}

std::unique_ptr<ComboBox>
QtToolkit::makeComboBox(const Design& design, const std::vector<String>& items, KeyEvent KeyDown) {
    auto* combo = new ChoiceBox(parentOf(design));
    combo->show();
    return adapt<ComboBoxAdapter>(design, Role::field, combo, items, std::move(KeyDown), mComforts);
}

std::unique_ptr<TextBox> QtToolkit::makeTextBox(const Design& design, KeyEvent KeyDown) {
    auto* const dialog = qobject_cast<QDialog*>(parentOf(design));
    QLineEdit* const text = dialog ? new NameBox(dialog) : new QLineEdit(parentOf(design));
    text->show();
    return adapt<TextBoxAdapter>(design, Role::field, text, std::move(KeyDown), mComforts);
}

std::unique_ptr<Label> QtToolkit::makeLabel(const Design& design) {
    auto* label = new QLabel(toQt(design.Caption), parentOf(design));
    label->setTextFormat(Qt::PlainText);
    label->show();
    return adapt<LabelAdapter>(design, Role::label, label);
}

std::unique_ptr<ScrollBar> QtToolkit::makeScrollBar(const Design& design, Orientation orientation,
                                                    ScrollBarEvents events) {
    const bool horizontal = orientation == Orientation::horizontal;
    auto* bar = new CanvasScrollBar(horizontal ? Qt::Horizontal : Qt::Vertical, parentOf(design));
    mView.setBar(bar);
    bar->show();
    return adapt<ScrollBarAdapter>(design, Role::field, static_cast<QScrollBar*>(bar),
                                   std::move(events));
}

std::unique_ptr<MSFlexGridLib::MSFlexGrid> QtToolkit::makeGrid(const Design& design,
                                                               std::int32_t rows, std::int32_t cols,
                                                               MSFlexGridLib::GridEvents events) {
    auto* grid = new GridWidget(rows, cols, parentOf(design));
    mGrid = grid;
    mFocus.setFallback(grid);
    mNavigation.setGrid(grid);
    return adapt<GridAdapter>(design, Role::field, grid, mDrags, mMenu, mComforts,
                              std::move(events));
}

std::unique_ptr<PopupMenu> QtToolkit::makePopupMenu(const Design& design, PlainEvent Click) {
    return std::make_unique<PopupMenuAdapter>(mSurface, mMenu, design, std::move(Click), this);
}

std::unique_ptr<Dialog> QtToolkit::makeDialog(const Design& design, DialogEvents events) {
    auto* dialog = new FormDialog(window(), std::move(events.Close));
    dialog->setPalette(mSurface.palette());
    dialog->setFont(mSurface.font());
    dialog->setLayoutDirection(mSurface.layoutDirection());
    dialog->setWindowTitle(toQt(design.Caption));
    dialog->setObjectName(toQt(design.Name));
    dialog->setProperty(ownerProperty, QVariant::fromValue(static_cast<void*>(this)));
    if (mComforts.flags().ReadsJoins)
        dialog->setPreparation([this](QDialog& open) { addJoinSentence(open, mComforts); });
    return std::make_unique<DialogAdapter>(dialog, mFocus);
}

std::unique_ptr<PickList> QtToolkit::makePickList(const Design& design, PickListEvents events) {
    auto* list = new PickListWidget(parentOf(design), std::move(events.Picked));
    list->setWords(mWords);
    return adapt<PickListAdapter>(design, Role::frame, list);
}

Ref<ImageList> QtToolkit::makeImageList(const Design&, const std::vector<Picture>& pictures) {
    return std::make_shared<Images>(pictures);
}

Ref<TalvikTabulet::Tabulet> QtToolkit::makeTabulet(const Design& design, std::int16_t index,
                                                   const TalvikTabulet::Tabulet* pattern,
                                                   const TalvikTabulet::TabuletEvents& events) {
    Canvas& canvas = canvasOf(design);
    auto* box = new TabuletWidget(index, canvas);
    box->hide();
    box->setWords(mWords);
    box->setObjectName(elementName(design.Name, index));
    if (const auto* holder = dynamic_cast<const WidgetHolder*>(pattern);
        holder && holder->widget() && holder->widget()->testAttribute(Qt::WA_SetFont))
        box->setFont(holder->widget()->font());
    auto table = std::make_shared<TabuletAdapter>(box, mFocus, mTables, index, events);
    if (const auto* shown = dynamic_cast<const TabuletAdapter*>(pattern)) {
        table->Images(shown->images());
        table->Locked(shown->isLocked());
    }
    return table;
}

Ref<Line> QtToolkit::makeLine(const Design& design, std::int16_t index) {
    return std::make_shared<CanvasLine>(canvasOf(design), elementName(design.Name, index), index,
                                        mAsked);
}

Ref<Shape> QtToolkit::makeShape(const Design& design, std::int16_t index) {
    return std::make_shared<CanvasShape>(canvasOf(design), elementName(design.Name, index));
}

// A widget has its host's font unless it was given one, which then is what its host wants for it.
Font QtToolkit::AmbientFont() const { return ControlFont(); }

Font QtToolkit::ControlFont() const { return fromQt(mSurface.font()); }

float QtToolkit::TextWidth(const String& text) const {
    const auto* grid = static_cast<const GridWidget*>(mGrid.data());
    return toTwips(grid ? grid->textWidth(toQt(text))
                        : QFontMetricsF(mSurface.font()).horizontalAdvance(toQt(text)));
}

float QtToolkit::ScaleWidth() const { return toTwips(mSurface.width()); }

float QtToolkit::ScaleHeight() const { return toTwips(mSurface.height()); }

std::uint32_t QtToolkit::RegisterWindowMessage(const String& name) {
    return static_cast<std::uint32_t>(ZandorWindowMessage::typeOf(toQt(name)));
}

void QtToolkit::SendMessage(std::uint32_t message, std::uintptr_t wParam, std::int32_t* lParam) {
    ZandorWindowMessage event(static_cast<QEvent::Type>(message), wParam, lParam);
    QCoreApplication::sendEvent(&mSurface, &event);
}

} // namespace zandor::platform::qt

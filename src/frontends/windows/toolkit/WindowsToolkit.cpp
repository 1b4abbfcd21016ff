#include "frontends/windows/toolkit/WindowsToolkit.h"

#include "frontends/windows/toolkit/Buttons.h"
#include "frontends/windows/toolkit/CanvasItems.h"
#include "frontends/windows/toolkit/Dialog.h"
#include "frontends/windows/toolkit/Frames.h"
#include "frontends/windows/toolkit/Grid.h"
#include "frontends/windows/toolkit/Images.h"
#include "frontends/windows/toolkit/Inputs.h"
#include "frontends/windows/toolkit/Modal.h"
#include "frontends/windows/toolkit/PickList.h"
#include "frontends/windows/toolkit/PopupMenu.h"
#include "frontends/windows/toolkit/ScrollBar.h"
#include "frontends/windows/toolkit/Tabulet.h"
#include "frontends/windows/toolkit/Text.h"
#include "frontends/windows/toolkit/partsIn.h"

#include <Zandor/platform/RuntimeError.h>

namespace zandor::platform::windows {

namespace {

Holder* holderOf(const Design& design) {
    if (!design.Container) return nullptr;
    auto* const holder = dynamic_cast<Holder*>(design.Container);
    if (!holder || !holder->window().isAlive()) throw errors::invalidProcedureCall();
    return holder;
}

const std::shared_ptr<Canvas>& canvasOf(const Design& design) {
    auto* const frame = dynamic_cast<CanvasFrame*>(holderOf(design));
    if (!frame) throw errors::invalidProcedureCall();
    return frame->canvas();
}

bool isDialog(const Holder* holder) { return dynamic_cast<const Dialog*>(holder) != nullptr; }

/// The sentence of the join that a dialog shows.
String sentenceOf(const FormWindow& form, const comforts::Comforts& comforts) {
    const auto text = [&](StringView name) {
        const Window* const box = form.child(name);
        return box ? textOf(box->hwnd()) : String();
    };
    const auto chosen = [&](StringView name) {
        const auto* const list = dynamic_cast<const ChoiceWindow*>(form.child(name));
        return list ? list->chosen() : -1;
    };
    return comforts.sentenceOf({.LeftTable = text(u"txtLeftTable"),
                                .LeftColumn = text(u"txtLeftColumn"),
                                .RightTable = text(u"txtRightTable"),
                                .RightColumn = text(u"txtRightColumn"),
                                .JoinType = chosen(u"cboJoinType"),
                                .CompareOperator = chosen(u"cboJoinCompareOperator")});
}

} // namespace

WindowsToolkit::WindowsToolkit(HWND parent, std::shared_ptr<void> keeper)
    : mSurroundings(std::make_shared<Surroundings>(*this, dpiOf(parent), std::move(keeper))),
      mSurface(std::make_shared<ControlWindow>(mSurroundings, parent)) {
    mSurroundings->surface = mSurface.get();
    mSurroundings->focus.setSurface(mSurface.get());
    mSurface->setName(u"UserControl");
}

WindowsToolkit::~WindowsToolkit() { mSurface->end(); }

void WindowsToolkit::setFont(HFONT font) {
    LOGFONTW look{};
    if (!font || !GetObjectW(font, sizeof look, &look)) return;
    mSurroundings->fonts.setOwn(look, mSurroundings->scale.dpi());
    for (const auto& part : partsIn(window())) part->applyFont();
    mSurroundings->fonts.dropOld();
    if (const PlainEvent resized = mSurface->onResize) resized();
}

void WindowsToolkit::setColours(std::optional<COLORREF> ground, std::optional<COLORREF> ink) {
    mSurroundings->hostsGround = ground;
    mSurroundings->hostsInk = ink;
    for (const auto& part : partsIn(window())) part->repaint();
    mSurface->repaint();
}

void WindowsToolkit::setWords(const Words& words) {
    mSurroundings->words = words;
    // Spoken.
    const auto name = [](const Window* part, const String& word) {
        if (part && part->hwnd()) SetWindowTextW(part->hwnd(), wide(word));
    };
    name(mSurface.get(), words.Designer);
    name(mSurroundings->canvas, words.Canvas);
    name(mSurroundings->grid, words.Grid);
    name(mSurroundings->across, words.ScrollAcross);
    name(mSurroundings->down, words.ScrollDown);
    name(mSurroundings->home, words.Home);
    if (mSurroundings->grid) mSurroundings->grid->repaint();
}

void WindowsToolkit::dismiss() {
    mDismissed = true;
    mSurroundings->drags.cancel();
    mBoxes.dismiss();
    if (mSurroundings->openMenu) EndMenu();
    if (IsWindow(mDialog))
        if (Window* const dialog = Window::of(mDialog)) dialog->end();
    mSurface->end();
}

HWND WindowsToolkit::owner() const {
    const HWND own = window();
    return mClosing || !own ? nullptr : GetAncestor(own, GA_ROOT);
}

HWND WindowsToolkit::parentOf(const Design& design) const {
    const Holder* const holder = holderOf(design);
    return holder ? holder->window().hwnd() : window();
}

template <class Part, class W, class... Arguments>
std::unique_ptr<Part> WindowsToolkit::make(const Design& design, Arguments&&... arguments) {
    auto window =
        std::make_shared<W>(mSurroundings, parentOf(design), std::forward<Arguments>(arguments)...);
    window->setName(design.Name);
    if (Holder* const holder = holderOf(design)) {
        if (holder->window().hasOwnFont()) window->setFont(holder->window().font());
        holder->take(*window);
    }
    return std::make_unique<Part>(std::move(window));
}

void WindowsToolkit::MsgBox(const String& prompt, std::int32_t style, const String& title) {
    if (mSilent) return;
    const auto around = mSurroundings; // the host may end the control while the box stands open
    const Modal modal(*around);
    if (mDismissed) return;
    const HWND root = owner();
    mBoxes.show(root && IsWindowVisible(root) ? root : nullptr, prompt, style, title);
    around->focus.restore();
}

std::unique_ptr<Frame> WindowsToolkit::makeFrame(const Design& design, FrameEvents events) {
    // Only the drawing surface listens to the mouse; other frames hold an editor's parts.
    if (events.MouseDown || events.MouseUp)
        return make<CanvasFrame, Canvas>(design, std::move(events));
    return make<RowFrame, RowWindow>(design, !design.Container);
}

std::unique_ptr<platform::CommandButton>
WindowsToolkit::makeCommandButton(const Design& design, CommandButtonEvents events) {
    const auto kind = design.Container ? ButtonWindow::Kind::caption : ButtonWindow::Kind::home;
    return make<CommandButton, ButtonWindow>(design, kind, String(design.Caption),
                                             std::move(events));
}

std::unique_ptr<platform::ComboBox> WindowsToolkit::makeComboBox(const Design& design,
                                                                 const std::vector<String>& items,
                                                                 KeyEvent KeyDown) {
    return make<ComboBox, ChoiceWindow>(design, items, std::move(KeyDown));
}

std::unique_ptr<platform::TextBox> WindowsToolkit::makeTextBox(const Design& design,
                                                               KeyEvent KeyDown) {
    return make<TextBox, TextWindow>(design, isDialog(holderOf(design)), std::move(KeyDown));
}

std::unique_ptr<platform::Label> WindowsToolkit::makeLabel(const Design& design) {
    return make<Label, LabelWindow>(design, String(design.Caption));
}

std::unique_ptr<platform::ScrollBar> WindowsToolkit::makeScrollBar(const Design& design,
                                                                   Orientation orientation,
                                                                   ScrollBarEvents events) {
    return make<ScrollBar, ScrollBarWindow>(design, orientation, std::move(events));
}

std::unique_ptr<MSFlexGridLib::MSFlexGrid>
WindowsToolkit::makeGrid(const Design& design, std::int32_t rows, std::int32_t cols,
                         MSFlexGridLib::GridEvents events) {
    return make<Grid, GridWindow>(design, rows, cols, std::move(events));
}

std::unique_ptr<platform::PopupMenu> WindowsToolkit::makePopupMenu(const Design&,
                                                                   PlainEvent Click) {
    return std::make_unique<PopupMenu>(mSurroundings, std::move(Click));
}

std::unique_ptr<platform::Dialog> WindowsToolkit::makeDialog(const Design& design,
                                                             DialogEvents events) {
    auto form = std::make_shared<FormWindow>(mSurroundings, owner(), String(design.Caption),
                                             std::move(events));
    form->setName(design.Name);
    if (mSurroundings->comforts.flags().ReadsJoins)
        form->setSentence([around = mSurroundings.get()](FormWindow& open) {
            return sentenceOf(open, around->comforts);
        });
    mDialog = form->hwnd();
    return std::make_unique<Dialog>(std::move(form));
}

std::unique_ptr<PickList> WindowsToolkit::makePickList(const Design& design,
                                                       PickListEvents events) {
    return make<PickListPart, PickWindow>(design, std::move(events));
}

Ref<ImageList> WindowsToolkit::makeImageList(const Design&, const std::vector<Picture>& pictures) {
    return std::make_shared<Images>(pictures);
}

Ref<TalvikTabulet::Tabulet>
WindowsToolkit::makeTabulet(const Design& design, std::int16_t index,
                            const TalvikTabulet::Tabulet* pattern,
                            const TalvikTabulet::TabuletEvents& events) {
    auto window = std::make_shared<TableWindow>(mSurroundings, canvasOf(design)->hwnd(), index);
    window->setName(String(design.Name) + u'(' + decimal(index) + u')');
    auto table = std::make_shared<Tabulet>(std::move(window), index, events);
    if (const auto* const shown = dynamic_cast<const Tabulet*>(pattern)) table->takeLookOf(*shown);
    return std::shared_ptr<TalvikTabulet::Tabulet>(std::move(table));
}

Ref<Line> WindowsToolkit::makeLine(const Design& design, std::int16_t index) {
    return std::make_shared<CanvasLine>(canvasOf(design), design.Name, index);
}

Ref<Shape> WindowsToolkit::makeShape(const Design& design, std::int16_t index) {
    return std::make_shared<CanvasShape>(canvasOf(design), design.Name, index);
}

// The control has its host's font, which then is what its host wants for it.
Font WindowsToolkit::AmbientFont() const { return ControlFont(); }

Font WindowsToolkit::ControlFont() const { return mSurroundings->fonts.own(); }

float WindowsToolkit::TextWidth(const String& text) const {
    Fonts& fonts = mSurroundings->fonts;
    return mSurroundings->scale.toTwips(fonts.widthOf(fonts.of(fonts.own()), text));
}

float WindowsToolkit::ScaleWidth() const {
    return mSurroundings->scale.toTwips(mSurface->area().right);
}

float WindowsToolkit::ScaleHeight() const {
    return mSurroundings->scale.toTwips(mSurface->area().bottom);
}

std::uint32_t WindowsToolkit::RegisterWindowMessage(const String& name) {
    return RegisterWindowMessageA(toUtf8(name).c_str());
}

void WindowsToolkit::SendMessage(std::uint32_t message, std::uintptr_t wParam,
                                 std::int32_t* lParam) {
    SendMessageA(window(), message, wParam, reinterpret_cast<LPARAM>(lParam));
}

} // namespace zandor::platform::windows

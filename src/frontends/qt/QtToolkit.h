#pragma once

#include "frontends/qt/CanvasView.h"
#include "frontends/qt/DragSession.h"
#include "frontends/qt/FocusTracker.h"
#include "frontends/qt/KeyboardMenu.h"
#include "frontends/qt/LineEnds.h"
#include "frontends/qt/Navigation.h"
#include "frontends/qt/TabuletAdapter.h"

#include <Zandor/comforts/Comforts.h>
#include <Zandor/platform/Toolkit.h>

#include <QPointer>

namespace zandor::platform::qt {

class GridWidget;
class WidgetHolder;

/// Makes one control's constituents as children of a widget, its surface.
class QtToolkit final : public Toolkit {
public:
    explicit QtToolkit(QWidget& surface);

    /// The surface is about to go: boxes shown from now on stand on their own.
    void close() { mClosing = true; }
    /// Boxes are left out.
    void setSilent(bool silent) { mSilent = silent; }
    /// The control has ended: its boxes, its dialog, its menu and its drag end too, untold.
    void dismiss();
    /// What the parts made so far, and those made later, say.
    void setWords(const Words& words);
    const Words& words() const { return mWords; }
    DragSession& drags() { return mDrags; }
    CanvasView& view() { return mView; }
    Navigation& navigation() { return mNavigation; }
    comforts::Comforts& comforts() { return mComforts; }
    /// nullptr before it is made.
    GridWidget* grid() const;
    /// A text still being composed is a text typed; one that its input method keeps back is none.
    void finishComposing() const;

    void MsgBox(const String& prompt, std::int32_t style, const String& title) override;
    std::unique_ptr<Frame> makeFrame(const Design& design, FrameEvents events) override;
    std::unique_ptr<CommandButton> makeCommandButton(const Design& design,
                                                     CommandButtonEvents events) override;
    std::unique_ptr<ComboBox> makeComboBox(const Design& design, const std::vector<String>& items,
                                           KeyEvent KeyDown) override;
    std::unique_ptr<TextBox> makeTextBox(const Design& design, KeyEvent KeyDown) override;
    std::unique_ptr<Label> makeLabel(const Design& design) override;
    std::unique_ptr<ScrollBar> makeScrollBar(const Design& design, Orientation orientation,
                                             ScrollBarEvents events) override;
    std::unique_ptr<MSFlexGridLib::MSFlexGrid> makeGrid(const Design& design, std::int32_t rows,
                                                        std::int32_t cols,
                                                        MSFlexGridLib::GridEvents events) override;
    std::unique_ptr<PopupMenu> makePopupMenu(const Design& design, PlainEvent Click) override;
    std::unique_ptr<Dialog> makeDialog(const Design& design, DialogEvents events) override;
    std::unique_ptr<PickList> makePickList(const Design& design, PickListEvents events) override;
    Ref<ImageList> makeImageList(const Design& design,
                                 const std::vector<Picture>& pictures) override;
    Ref<TalvikTabulet::Tabulet> makeTabulet(const Design& design, std::int16_t index,
                                            const TalvikTabulet::Tabulet* pattern,
                                            const TalvikTabulet::TabuletEvents& events) override;
    Ref<Line> makeLine(const Design& design, std::int16_t index) override;
    Ref<Shape> makeShape(const Design& design, std::int16_t index) override;

    Font AmbientFont() const override;
    Font ControlFont() const override;
    float TextWidth(const String& text) const override;
    float ScaleWidth() const override;
    float ScaleHeight() const override;
    std::uint32_t RegisterWindowMessage(const String& name) override;
    void SendMessage(std::uint32_t message, std::uintptr_t wParam, std::int32_t* lParam) override;

private:
    QWidget* parentOf(const Design& design) const;
    QWidget* window() const;
    template <class AdapterType, class W, class... Arguments>
    std::unique_ptr<AdapterType> adapt(const Design& design, Role role, W* widget,
                                       Arguments&&... arguments);

    QWidget& mSurface;
    FocusTracker mFocus;
    DragSession mDrags;
    KeyboardMenu mMenu;
    LineEnds mAsked;
    comforts::Comforts mComforts{*this};
    TabuletSurroundings mTables{mDrags, mMenu, mAsked, mComforts};
    CanvasView mView{mMenu, mDrags, mComforts};
    Navigation mNavigation{mSurface, mView, mComforts};
    QPointer<QWidget> mGrid;
    Words mWords;
    bool mClosing = false;
    bool mSilent = false;
};

} // namespace zandor::platform::qt

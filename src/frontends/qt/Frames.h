#pragma once

#include "frontends/qt/Adapter.h"
#include "frontends/qt/Canvas.h"

#include <Zandor/platform/Intrinsic.h>

#include <QFrame>

namespace zandor::platform::qt {

/// The frame that tables and joins are drawn on.
class CanvasAdapter final : public Adapter<platform::Frame, Canvas> {
public:
    CanvasAdapter(Canvas* widget, FocusTracker& focus, FrameEvents events);
    ~CanvasAdapter() override;

    bool Visible() const override { return mWidget && !mWidget->isHidden(); }
    void Visible(bool value) override { show(value); }
    void ZOrder() override;
};

/// A frame whose children stand side by side in the order of their making. It is as large as they
/// need, until a size is set.
class RowFrame : public QFrame {
public:
    /// What the inputs inside are for, asked as the frame is shown.
    using Title = std::function<QString()>;

    RowFrame(QWidget* parent, bool outermost);

    void setTitle(Title title) { mTitle = std::move(title); }

protected:
    bool event(QEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void paintEvent(QPaintEvent* event) override;

private:
    const bool mOutermost;
    Title mTitle;
};

class RowFrameAdapter final : public Adapter<platform::Frame, RowFrame> {
public:
    using Adapter::Adapter;

    Bounds bounds() const override;
    void setBounds(const Bounds& bounds) override;
    void place(QWidget* child, Role role) override;
    bool Visible() const override { return mWidget && !mWidget->isHidden(); }
    void Visible(bool value) override;
    void ZOrder() override;

private:
    bool mSized = false;
};

} // namespace zandor::platform::qt

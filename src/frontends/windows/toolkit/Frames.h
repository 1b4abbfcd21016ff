#pragma once

#include "frontends/windows/toolkit/Constituent.h"

#include <Zandor/platform/Intrinsic.h>

#include <vector>

namespace zandor::platform::windows {

/// A frame whose children stand side by side in the order of their making. It is as large as they
/// need, until a size is set.
class RowWindow final : public Window {
public:
    RowWindow(std::shared_ptr<Surroundings> surroundings, HWND parent, bool outermost);

    void add(Window& child);
    /// Lays the children out anew, after one has come to need another size.
    void arrange();
    /// Escape, which is the input's.
    void escape();
    /// Its button that Enter presses; false: there is none.
    bool pressDefault();
    bool isOutermost() const { return mOutermost; }
    SIZE wanted() const override;

protected:
    LRESULT handle(const Message& message) override;
    void fontChanged() override { arrange(); }

private:
    int margin() const;

    const bool mOutermost;
    std::vector<std::weak_ptr<Window>> mChildren;
};

class RowFrame final : public Constituent<platform::Frame, RowWindow> {
public:
    using Constituent::Constituent;

    Bounds bounds() const override;
    void setBounds(const Bounds& bounds) override;
    void take(Window& child) override { mWindow->add(child); }
    bool Visible() const override { return mWindow->isShown(); }
    void Visible(bool value) override;
    void ZOrder() override { mWindow->raise(); }

private:
    bool mSized = false;
};

/// The editor that a window stands in, nullptr: it stands in none.
RowWindow* editorAround(HWND window);

} // namespace zandor::platform::windows

#pragma once

#include "frontends/windows/toolkit/Surroundings.h"

#include <utility>

namespace zandor::platform::windows {

/// A control of the platform's that is a window.
class Holder {
public:
    virtual ~Holder() = default;
    virtual Window& window() const = 0;
    /// A child has been made; a container that lays its children out takes it in.
    virtual void take(Window& child) { (void)child; }
};

/// A control of the platform interfaces over a window. The system may destroy the window before,
/// with its host's; it goes with this at the latest.
template <class Interface, class W>
class Constituent : public Interface, public Holder {
public:
    explicit Constituent(std::shared_ptr<W> window) : mWindow(std::move(window)) {}
    ~Constituent() override { mWindow->end(); }

    Window& window() const override { return *mWindow; }

    Bounds bounds() const override { return mWindow->bounds(); }
    void setBounds(const Bounds& bounds) override { mWindow->setBounds(bounds); }

protected:
    Surroundings& surroundings() const { return mWindow->surroundings(); }

    /// The control's own font is the surroundings', which may change.
    void setFont(const Font& font) {
        if (font == surroundings().fonts.own())
            mWindow->setFont({});
        else
            mWindow->setFont(font);
    }

    const std::shared_ptr<W> mWindow;
};

} // namespace zandor::platform::windows

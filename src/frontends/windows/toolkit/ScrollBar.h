#pragma once

#include "frontends/windows/toolkit/Constituent.h"
#include "frontends/windows/toolkit/ScrollRange.h"

#include <Zandor/platform/Intrinsic.h>

namespace zandor::platform::windows {

/// The system's scroll bar over 0 to a maximum, in twips.
class ScrollBarWindow final : public Window {
public:
    ScrollBarWindow(std::shared_ptr<Surroundings> surroundings, HWND parent,
                    Orientation orientation, ScrollBarEvents events);
    ~ScrollBarWindow() override;

    Orientation orientation() const { return mOrientation; }
    int value() const { return mValue; }
    int max() const { return mMax; }
    int largeChange() const { return mLargeChange; }
    void setMax(int max);
    void setLargeChange(int change);
    /// What is outside its range is brought to its ends.
    void scrollTo(int value);
    void scrollBy(float twips);
    /// Of the system's bars: width of an upright, height of a lying one.
    int thickness() const;

    std::optional<LRESULT> told(const Message& message) override;
    void gotFocus() override;

    /// One press on an arrow, one line of the wheel: twips.
    static constexpr float step = 240;

protected:
    LRESULT handle(const Message& message) override;
    void forget() override;

private:
    void showRange();

    const Orientation mOrientation;
    ScrollBarEvents mEvents;
    int mValue = 0;
    int mMax = 0;
    int mLargeChange = 1;
    ScrollRange mRange;
};

class ScrollBar final : public Constituent<platform::ScrollBar, ScrollBarWindow> {
public:
    using Constituent::Constituent;

    /// As thick as the system has it.
    Bounds bounds() const override;
    std::int16_t Max() const override { return static_cast<std::int16_t>(mWindow->max()); }
    void Max(std::int16_t value) override;
    std::int16_t Value() const override { return static_cast<std::int16_t>(mWindow->value()); }
    void Value(std::int16_t value) override;
    void LargeChange(std::int16_t value) override;
    void Enabled(bool value) override { mWindow->enable(value); }
};

} // namespace zandor::platform::windows

#pragma once

#include "frontends/windows/automation/pages/PageValues.h"

#include <functional>
#include <memory>

namespace zandor::automation {

/// The property page as a window: a list of names and values, and below it the chosen value to be
/// changed.
class PageWindow final : public std::enable_shared_from_this<PageWindow> {
public:
    /// Hidden, below a window of a form's. `changed` hears of each value that the user changes, and
    /// may end this. std::bad_alloc where the system has no window to give.
    static std::shared_ptr<PageWindow> open(HWND parent, PageValues& values,
                                            std::function<void()> changed);
    /// As large as it would like to be, in pixels.
    static SIZE wanted();

    PageWindow(const PageWindow&) = delete;
    PageWindow& operator=(const PageWindow&) = delete;
    ~PageWindow();

    HWND handle() const { return mHandle; }
    void move(const RECT& place) const;
    /// What the values are has changed.
    void refresh();
    /// Chooses a row, to be changed by the keyboard.
    void edit(std::size_t row);
    /// Tells the user why nothing was written, and chooses the row.
    void refuse(const PageValues::Refusal& refusal);
    /// A key that goes somewhere within the page; false: it is the frame's.
    bool take(MSG& message) const;
    /// Whether Tab would leave it.
    bool isLeftBy(const MSG& message) const;

private:
    PageWindow(PageValues& values, std::function<void()> changed);
    static INT_PTR CALLBACK procedure(HWND handle, UINT message, WPARAM w, LPARAM l);

    void fill();
    void layOut() const;
    void select(std::size_t row) const;
    void show(std::size_t row, const platform::String& text) const;
    void chosen(std::size_t row);
    void typed();
    void toggle();
    bool notified(const NMHDR& what);
    bool handle(UINT message, WPARAM w, LPARAM l);
    HWND item(int number) const { return GetDlgItem(mHandle, number); }
    HWND editor() const;

    PageValues& mValues;
    const std::function<void()> mChanged;
    HWND mHandle = nullptr;
    std::size_t mRow = 0;
    bool mFilling = false; ///< what the windows tell of is our own doing
};

} // namespace zandor::automation

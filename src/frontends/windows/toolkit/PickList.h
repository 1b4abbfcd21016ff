#pragma once

#include "frontends/windows/toolkit/Constituent.h"

#include <Zandor/platform/PickList.h>

#include <vector>

namespace zandor::platform::windows {

class PickBox;
class PickItems;

/// A box for typing with the list of what is left below it.
class PickWindow final : public Window {
public:
    PickWindow(std::shared_ptr<Surroundings> surroundings, HWND parent, PickListEvents events);

    void open(const RECT& over, std::vector<String> items, const String& typed, int position);
    void close();

    Window& box() const;
    HWND list() const;
    /// The items that are left, and what is typed.
    std::vector<String> left() const;
    String typed() const;

    // What box and list tell.
    bool keyPressed(WPARAM key);
    void textChanged();
    void pickAt(int row);
    void boxLeft();

protected:
    LRESULT handle(const Message& message) override;
    void forget() override;
    void fontChanged() override;

private:
    void stand(const RECT& over);
    void filter();
    void chooseFirst();
    void arrange();
    int boxHeight() const;
    int rowHeight() const;
    int current() const;
    void setCurrent(int row);

    PickListEvents mEvents;
    std::shared_ptr<PickBox> mBox;
    std::shared_ptr<PickItems> mList;
    std::vector<String> mItems;
    std::vector<int> mLeft; ///< positions among all
    bool mFilling = false;
};

class PickListPart final : public Constituent<platform::PickList, PickWindow> {
public:
    using Constituent::Constituent;

    void Open(const Bounds& over, const std::vector<String>& items, const String& typed,
              std::int32_t position) override;
    void Close() override { mWindow->close(); }
    bool IsOpen() const override { return mWindow->isShown(); }
};

} // namespace zandor::platform::windows

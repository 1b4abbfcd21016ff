#include "frontends/windows/toolkit/ModalBox.h"

#include "frontends/windows/toolkit/Text.h"

#include <algorithm>
#include <utility>

namespace zandor::platform::windows {

/// Learns which window a box is, for as long as it stands open: the system does not say.
class BoxWatch {
public:
    explicit BoxWatch(ModalBoxes& boxes)
        : mBoxes(boxes), mBefore(std::exchange(current(), this)), mDepth(boxes.mOpen.size()),
          mHook(SetWindowsHookExW(WH_CBT, &created, nullptr, GetCurrentThreadId())) {}
    BoxWatch(const BoxWatch&) = delete;
    BoxWatch& operator=(const BoxWatch&) = delete;
    ~BoxWatch() {
        unhook();
        current() = mBefore;
        mBoxes.mOpen.resize(mDepth);
    }

private:
    static BoxWatch*& current() {
        thread_local BoxWatch* watch = nullptr;
        return watch;
    }

    void unhook() {
        if (const HHOOK hook = std::exchange(mHook, nullptr)) UnhookWindowsHookEx(hook);
    }

    static LRESULT CALLBACK created(int code, WPARAM w, LPARAM l) {
        // First, for with the hook goes the way to those before it.
        const LRESULT result = CallNextHookEx(nullptr, code, w, l);
        // The first window that becomes active is the box.
        if (BoxWatch* const watch = current(); code == HCBT_ACTIVATE && watch && watch->mHook) {
            watch->mBoxes.mOpen.push_back(reinterpret_cast<HWND>(w));
            watch->unhook();
        }
        return result;
    }

    ModalBoxes& mBoxes;
    BoxWatch* const mBefore;
    const std::size_t mDepth;
    HHOOK mHook;
};

void ModalBoxes::show(HWND owner, const String& prompt, std::int32_t style, const String& title) {
    const BoxWatch watch(*this);
    MessageBoxW(owner, wide(prompt), wide(title), static_cast<UINT>(style));
}

void ModalBoxes::dismiss() const {
    std::for_each(mOpen.rbegin(), mOpen.rend(),
                  [](HWND box) { PostMessageW(box, WM_CLOSE, 0, 0); });
}

} // namespace zandor::platform::windows

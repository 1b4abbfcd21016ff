#include "frontends/windows/toolkit/Accessible.h"

#include "frontends/windows/toolkit/Spoken.h"
#include "frontends/windows/toolkit/Surroundings.h"
#include "frontends/windows/toolkit/Text.h"

#include <Zandor/windows/Counted.h>

#include <algorithm>
#include <utility>

#include <oleacc.h>
#include <wrl/client.h>

namespace zandor::platform::windows {

namespace {

using Microsoft::WRL::ComPtr;

// By __uuidof: of IID_IAccessible mingw's import library makes a function.

VARIANT numbered(LONG number) {
    VARIANT value{};
    value.vt = VT_I4;
    value.lVal = number;
    return value;
}

VARIANT self() { return numbered(CHILDID_SELF); }

/// Walks the numbers of several parts.
class Numbers final : public Counted<IEnumVARIANT> {
public:
    Numbers(std::vector<int> numbers, std::size_t place, std::shared_ptr<void> keeper)
        : mKeeper(std::move(keeper)), mNumbers(std::move(numbers)), mPlace(place) {}

    STDMETHODIMP Next(ULONG count, VARIANT* items, ULONG* fetched) override {
        if (!items) return E_POINTER;
        ULONG n = 0;
        for (; n < count && mPlace < mNumbers.size(); ++n) items[n] = numbered(mNumbers[mPlace++]);
        if (fetched) *fetched = n;
        return n == count ? S_OK : S_FALSE;
    }
    STDMETHODIMP Skip(ULONG count) override {
        const std::size_t left = mNumbers.size() - mPlace;
        mPlace += std::min<std::size_t>(count, left);
        return count <= left ? S_OK : S_FALSE;
    }
    STDMETHODIMP Reset() override {
        mPlace = 0;
        return S_OK;
    }
    STDMETHODIMP Clone(IEnumVARIANT** other) override {
        if (!other) return E_POINTER;
        *other = ComPtr<IEnumVARIANT>(new Numbers(mNumbers, mPlace, mKeeper)).Detach();
        return S_OK;
    }

private:
    const std::shared_ptr<void> mKeeper;
    const std::vector<int> mNumbers;
    std::size_t mPlace;
};

/// The object that speaks for a window. Its children are the windows in it, which have objects of
/// their own, and then its parts, which are known by their numbers. A reader may keep it for longer
/// than the window is there.
class Accessible final : public Counted<IAccessible> {
public:
    Accessible(Window& window, std::unique_ptr<Spoken> spoken)
        : mKeeper(window.surroundings().keeper), mWindow(window.weak_from_this()),
          mSpoken(std::move(spoken)) {
        CreateStdAccessibleObject(window.hwnd(), OBJID_CLIENT, IID_PPV_ARGS(&mSystems));
    }

    // Nobody asks for its members by name.
    STDMETHODIMP GetTypeInfoCount(UINT* count) override {
        if (!count) return E_POINTER;
        *count = 0;
        return S_OK;
    }
    STDMETHODIMP GetTypeInfo(UINT, LCID, ITypeInfo**) override { return E_NOTIMPL; }
    STDMETHODIMP GetIDsOfNames(REFIID, LPOLESTR*, UINT, LCID, DISPID*) override {
        return E_NOTIMPL;
    }
    STDMETHODIMP Invoke(DISPID, REFIID, LCID, WORD, DISPPARAMS*, VARIANT*, EXCEPINFO*,
                        UINT*) override {
        return E_NOTIMPL;
    }

    STDMETHODIMP get_accParent(IDispatch** parent) override {
        if (!parent) return E_POINTER;
        *parent = nullptr;
        return ask([&](Window& window) {
            // What the host's window is, the system says.
            if (Window* const above = Window::of(GetAncestor(window.hwnd(), GA_PARENT)))
                return objectOf(above->hwnd(), IID_IDispatch, parent);
            return mSystems ? mSystems->get_accParent(parent) : S_FALSE;
        });
    }
    STDMETHODIMP get_accChildCount(LONG* count) override {
        if (!count) return E_POINTER;
        *count = 0;
        return ask([&](Window&) {
            *count = static_cast<LONG>(mSpoken->windows().size()) + mSpoken->count();
            return S_OK;
        });
    }
    STDMETHODIMP get_accChild(VARIANT which, IDispatch** child) override {
        if (!child) return E_POINTER;
        *child = nullptr;
        return ask(which, [&](const Target& target) {
            if (target.below) return target.below.CopyTo(IID_IDispatch, toAny(child));
            if (target.part > 0) return S_FALSE; // it has no object of its own
            AddRef();
            *child = this;
            return S_OK;
        });
    }

    STDMETHODIMP get_accName(VARIANT which, BSTR* name) override {
        return say(
            which, name, [&](IAccessible& below) { return below.get_accName(self(), name); },
            [](Window& window) { return textOf(window.hwnd()); }, &SpokenPart::name);
    }
    STDMETHODIMP get_accDescription(VARIANT which, BSTR* text) override {
        return say(
            which, text, [&](IAccessible& below) { return below.get_accDescription(self(), text); },
            [&](Window&) { return mSpoken->description(); }, &SpokenPart::description);
    }
    STDMETHODIMP get_accValue(VARIANT which, BSTR* value) override {
        return say(
            which, value, [&](IAccessible& below) { return below.get_accValue(self(), value); },
            [](Window&) { return String(); }, &SpokenPart::value);
    }
    STDMETHODIMP get_accDefaultAction(VARIANT which, BSTR* action) override {
        return say(
            which, action,
            [&](IAccessible& below) { return below.get_accDefaultAction(self(), action); },
            [](Window&) { return String(); }, &SpokenPart::action);
    }
    STDMETHODIMP get_accHelp(VARIANT which, BSTR* help) override { return nothing(which, help); }
    STDMETHODIMP get_accKeyboardShortcut(VARIANT which, BSTR* keys) override {
        return nothing(which, keys);
    }
    STDMETHODIMP get_accHelpTopic(BSTR* file, VARIANT which, LONG* topic) override {
        if (!topic) return E_POINTER;
        *topic = 0;
        return nothing(which, file);
    }

    STDMETHODIMP get_accRole(VARIANT which, VARIANT* role) override {
        if (!role) return E_POINTER;
        *role = {};
        return ask(which, [&](const Target& target) {
            if (target.below) return target.below->get_accRole(self(), role);
            *role = numbered(target.part > 0 ? mSpoken->part(target.part).role : mSpoken->role());
            return S_OK;
        });
    }
    STDMETHODIMP get_accState(VARIANT which, VARIANT* state) override {
        if (!state) return E_POINTER;
        *state = {};
        return ask(which, [&](const Target& target) {
            if (target.below) return target.below->get_accState(self(), state);
            if (target.part > 0) {
                *state = numbered(mSpoken->part(target.part).state);
                return S_OK;
            }
            const HWND own = target.window->hwnd();
            *state =
                numbered(STATE_SYSTEM_FOCUSABLE | (GetFocus() == own ? STATE_SYSTEM_FOCUSED : 0) |
                         (IsWindowVisible(own) ? 0 : STATE_SYSTEM_INVISIBLE) |
                         (IsWindowEnabled(own) ? 0 : STATE_SYSTEM_UNAVAILABLE));
            return S_OK;
        });
    }

    STDMETHODIMP get_accFocus(VARIANT* focus) override {
        if (!focus) return E_POINTER;
        *focus = {};
        return ask([&](Window& window) {
            const HWND has = GetFocus();
            if (has == window.hwnd()) {
                const int part = mSpoken->focused();
                *focus = numbered(part > 0 ? numberOf(part) : CHILDID_SELF);
                return S_OK;
            }
            return has ? handIfBelow(has, *focus) : S_FALSE;
        });
    }
    STDMETHODIMP get_accSelection(VARIANT* selection) override {
        if (!selection) return E_POINTER;
        *selection = {};
        return ask([&](Window&) {
            std::vector<int> numbers = mSpoken->selected();
            if (numbers.empty()) return S_FALSE;
            for (int& number : numbers) number = static_cast<int>(numberOf(number));
            if (numbers.size() == 1) {
                *selection = numbered(numbers.front());
                return S_OK;
            }
            selection->vt = VT_UNKNOWN;
            selection->punkVal =
                ComPtr<IEnumVARIANT>(new Numbers(std::move(numbers), 0, mKeeper)).Detach();
            return S_OK;
        });
    }
    STDMETHODIMP accSelect(LONG how, VARIANT which) override {
        return ask(which, [&](const Target& target) {
            if (target.below) return target.below->accSelect(how, self());
            if (target.part > 0) return mSpoken->select(target.part, how) ? S_OK : E_INVALIDARG;
            if (how != SELFLAG_TAKEFOCUS) return E_INVALIDARG;
            SetFocus(target.window->hwnd());
            return S_OK;
        });
    }
    STDMETHODIMP accDoDefaultAction(VARIANT which) override {
        return ask(which, [&](const Target& target) {
            if (target.below) return target.below->accDoDefaultAction(self());
            if (target.part == 0 || mSpoken->part(target.part).action.empty())
                return DISP_E_MEMBERNOTFOUND;
            mSpoken->press(target.part);
            return S_OK;
        });
    }

    STDMETHODIMP accLocation(LONG* left, LONG* top, LONG* width, LONG* height,
                             VARIANT which) override {
        if (!left || !top || !width || !height) return E_POINTER;
        *left = *top = *width = *height = 0;
        return ask(which, [&](const Target& target) {
            if (target.below) return target.below->accLocation(left, top, width, height, self());
            RECT place = target.part > 0 ? mSpoken->part(target.part).place : target.window->area();
            MapWindowPoints(target.window->hwnd(), nullptr, reinterpret_cast<POINT*>(&place), 2);
            *left = place.left;
            *top = place.top;
            *width = place.right - place.left;
            *height = place.bottom - place.top;
            return S_OK;
        });
    }
    STDMETHODIMP accHitTest(LONG x, LONG y, VARIANT* child) override {
        if (!child) return E_POINTER;
        *child = {};
        return ask([&](Window& window) {
            POINT at{x, y};
            ScreenToClient(window.hwnd(), &at);
            const RECT inside = window.area();
            if (!PtInRect(&inside, at)) return S_FALSE;
            const HWND hit = ChildWindowFromPointEx(window.hwnd(), at, CWP_SKIPINVISIBLE);
            if (hit && hit != window.hwnd()) return handIfBelow(hit, *child);
            const int part = mSpoken->partAt(at);
            *child = numbered(part > 0 ? numberOf(part) : CHILDID_SELF);
            return S_OK;
        });
    }
    STDMETHODIMP accNavigate(LONG way, VARIANT from, VARIANT* to) override {
        if (!to) return E_POINTER;
        *to = {};
        return ask(from, [&](const Target& target) {
            LONG count = 0;
            get_accChildCount(&count);
            LONG place = 0;
            switch (way) {
            case NAVDIR_FIRSTCHILD: place = target.isSelf() ? 1 : 0; break;
            case NAVDIR_LASTCHILD: place = target.isSelf() ? count : 0; break;
            case NAVDIR_NEXT: place = target.isSelf() ? 0 : from.lVal + 1; break;
            case NAVDIR_PREVIOUS: place = target.isSelf() ? 0 : from.lVal - 1; break;
            default: return S_FALSE;
            }
            if (place < 1 || place > count) return S_FALSE;
            IDispatch* object = nullptr;
            if (get_accChild(numbered(place), &object) == S_OK) {
                to->vt = VT_DISPATCH;
                to->pdispVal = object;
            } else {
                *to = numbered(place);
            }
            return S_OK;
        });
    }

    STDMETHODIMP put_accName(VARIANT, BSTR) override { return DISP_E_MEMBERNOTFOUND; }
    STDMETHODIMP put_accValue(VARIANT, BSTR) override { return DISP_E_MEMBERNOTFOUND; }

protected:
    bool inherits(REFIID iid) const override { return iid == IID_IDispatch; }

private:
    /// What a number stands for: the window itself, a part of it, or the object of a window in it.
    struct Target {
        Window* window = nullptr;
        int part = 0;
        ComPtr<IAccessible> below;

        bool isSelf() const { return part == 0 && !below; }
    };

    static void** toAny(IDispatch** place) { return reinterpret_cast<void**>(place); }

    template <class T>
    static HRESULT objectOf(HWND window, REFIID iid, T** object) {
        return AccessibleObjectFromWindow(window, static_cast<DWORD>(OBJID_CLIENT), iid,
                                          reinterpret_cast<void**>(object));
    }

    template <class Body>
    HRESULT ask(Body&& body) {
        const std::shared_ptr<Window> window = mWindow.lock();
        if (!window || !window->isAlive()) return CO_E_OBJNOTCONNECTED;
        const ComPtr<IAccessible> meanwhile(this);
        try {
            return body(*window);
        } catch (const std::bad_alloc&) {
            return E_OUTOFMEMORY;
        } catch (...) {
            return E_FAIL; // a part has gone that was there a moment ago
        }
    }
    template <class Body>
    HRESULT ask(const VARIANT& which, Body&& body) {
        return ask([&](Window& window) -> HRESULT {
            if (which.vt != VT_I4 || which.lVal < 0) return E_INVALIDARG;
            Target target;
            target.window = &window;
            if (which.lVal > 0) {
                const std::vector<HWND> windows = mSpoken->windows();
                const auto place = static_cast<std::size_t>(which.lVal) - 1;
                if (place < windows.size()) {
                    const HRESULT found = objectOf(windows[place], __uuidof(IAccessible),
                                                   target.below.GetAddressOf());
                    if (FAILED(found)) return found;
                } else {
                    target.part = static_cast<int>(place - windows.size()) + 1;
                    if (target.part > mSpoken->count()) return E_INVALIDARG;
                }
            }
            return body(std::as_const(target));
        });
    }

    template <class Below, class Own>
    HRESULT say(const VARIANT& which, BSTR* text, Below&& below, Own&& own,
                String SpokenPart::*ofPart) {
        if (!text) return E_POINTER;
        *text = nullptr;
        return ask(which, [&](const Target& target) -> HRESULT {
            if (target.below) return below(*target.below.Get());
            const String said =
                target.part > 0 ? mSpoken->part(target.part).*ofPart : own(*target.window);
            if (said.empty()) return S_FALSE;
            *text = SysAllocStringLen(wide(said), static_cast<UINT>(said.size()));
            return *text ? S_OK : E_OUTOFMEMORY;
        });
    }
    HRESULT nothing(const VARIANT& which, BSTR* text) {
        if (!text) return E_POINTER;
        *text = nullptr;
        return ask(which, [](const Target&) { return S_FALSE; });
    }

    LONG numberOf(int part) const { return static_cast<LONG>(mSpoken->windows().size()) + part; }
    /// The object of the window in this one that another one is or stands in.
    HRESULT handIfBelow(HWND window, VARIANT& place) const {
        for (const HWND child : mSpoken->windows()) {
            if (child != window && !IsChild(child, window)) continue;
            IDispatch* object = nullptr;
            const HRESULT found = objectOf(child, IID_IDispatch, &object);
            if (FAILED(found)) return found;
            place.vt = VT_DISPATCH;
            place.pdispVal = object;
            return S_OK;
        }
        return S_FALSE;
    }

    const std::shared_ptr<void> mKeeper; ///< this code stays as long as somebody holds this
    const std::weak_ptr<Window> mWindow;
    const std::unique_ptr<Spoken> mSpoken;
    ComPtr<IAccessible> mSystems;
};

} // namespace

std::optional<LRESULT> answerReader(Window& window, const Message& message) {
    if (static_cast<LONG>(message.l) != OBJID_CLIENT || !window.isAlive()) return {};
    auto spoken = spokenOf(window);
    if (!spoken) return {};
    const ComPtr<IAccessible> object(new Accessible(window, std::move(spoken)));
    return LresultFromObject(__uuidof(IAccessible), message.w, object.Get());
}

void tellReader(Window& window) {
    if (!window.isAlive() || GetFocus() != window.hwnd()) return;
    const auto spoken = spokenOf(window);
    if (!spoken) return;
    const int part = spoken->focused();
    const LONG number = part > 0 ? static_cast<LONG>(spoken->windows().size()) + part : 0;
    NotifyWinEvent(EVENT_OBJECT_FOCUS, window.hwnd(), OBJID_CLIENT, number);
}

} // namespace zandor::platform::windows

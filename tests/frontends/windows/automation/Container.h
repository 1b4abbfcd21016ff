#pragma once

#include "Dll.h"

#include "frontends/windows/automation/com/Value.h"

#include <functional>
#include <map>
#include <string>
#include <vector>

/// A form that holds one control in its window: what the system's containers do, and nothing else.
/// It keeps a record of what the control asks it for.
class Container final : public IOleClientSite,
                        public IOleInPlaceSite,
                        public IOleInPlaceFrame,
                        public IOleControlSite,
                        public IDispatch,
                        public IAdviseSink {
public:
    template <class T>
    using Held = zandor::automation::Held<T>;
    using Calls = std::vector<std::string>;

    /// Its window is shown, with a new control in none yet; `ambient` is what its site says of
    /// itself.
    explicit Container(std::map<DISPID, zandor::automation::Value> ambient = {});
    Container(const Container&) = delete;
    Container& operator=(const Container&) = delete;
    virtual ~Container();

    HWND window() const { return mWindow; }
    /// Of the control, while it is active.
    HWND controlWindow() const;
    const Held<_Zandor>& control() const { return mControl; }
    template <class T>
    Held<T> as() const {
        return Held<T>::of(mControl.get());
    }

    HRESULT tell(LONG verb) const;
    /// Closes the control and lets go of it, as a form does that is unloaded.
    void unload();
    /// Lets go of the control without a word.
    void drop() { mControl = {}; }

    /// Deals with the messages at hand; the active control has its keys first.
    void pump() const;
    /// Presses a key with Shift (1), Control (2) and Alt (4) where the focus is.
    void press(int key, int shift = 0) const;
    /// Clicks in the control's window.
    void click(POINT at) const;

    /// What was asked for since it was looked at last.
    Calls calls() { return std::exchange(mCalls, {}); }
    /// Done once when this is called next; what it answers is handed back.
    std::map<std::string, std::function<HRESULT()>> on;
    /// Keys that are the container's own.
    std::vector<WPARAM> own;
    RECT place{20, 30, 620, 430};
    RECT clip{0, 0, 32000, 32000};
    std::map<DISPID, zandor::automation::Value> ambient;

    STDMETHODIMP QueryInterface(REFIID iid, void** object) override;
    // It lives as long as its test.
    STDMETHODIMP_(ULONG) AddRef() override { return static_cast<ULONG>(++mReferences); }
    STDMETHODIMP_(ULONG) Release() override { return static_cast<ULONG>(--mReferences); }
    int references() const { return mReferences; }
    /// How many boxes, dialogs and menus of the control the frame has been told of that are open.
    int modal() const { return mModal; }

    // The site
    STDMETHODIMP SaveObject() override { return heard("SaveObject"); }
    STDMETHODIMP GetMoniker(DWORD, DWORD, IMoniker**) override { return E_NOTIMPL; }
    STDMETHODIMP GetContainer(IOleContainer** container) override;
    STDMETHODIMP ShowObject() override { return heard("ShowObject"); }
    STDMETHODIMP OnShowWindow(BOOL) override { return heard("OnShowWindow"); }
    STDMETHODIMP RequestNewObjectLayout() override { return E_NOTIMPL; }

    // In place
    STDMETHODIMP GetWindow(HWND* window) override;
    STDMETHODIMP ContextSensitiveHelp(BOOL) override { return E_NOTIMPL; }
    STDMETHODIMP CanInPlaceActivate() override { return heard("CanInPlaceActivate"); }
    STDMETHODIMP OnInPlaceActivate() override { return heard("OnInPlaceActivate"); }
    STDMETHODIMP OnUIActivate() override { return heard("OnUIActivate"); }
    STDMETHODIMP GetWindowContext(IOleInPlaceFrame** frame, IOleInPlaceUIWindow** document,
                                  RECT* place, RECT* clip, OLEINPLACEFRAMEINFO* info) override;
    STDMETHODIMP Scroll(SIZE) override { return E_NOTIMPL; }
    STDMETHODIMP OnUIDeactivate(BOOL) override { return heard("OnUIDeactivate"); }
    STDMETHODIMP OnInPlaceDeactivate() override { return heard("OnInPlaceDeactivate"); }
    STDMETHODIMP DiscardUndoState() override { return E_NOTIMPL; }
    STDMETHODIMP DeactivateAndUndo() override { return E_NOTIMPL; }
    STDMETHODIMP OnPosRectChange(LPCRECT) override { return heard("OnPosRectChange"); }

    // The frame
    STDMETHODIMP GetBorder(RECT*) override { return INPLACE_E_NOTOOLSPACE; }
    STDMETHODIMP RequestBorderSpace(LPCBORDERWIDTHS) override { return INPLACE_E_NOTOOLSPACE; }
    STDMETHODIMP SetBorderSpace(LPCBORDERWIDTHS) override { return S_OK; }
    STDMETHODIMP SetActiveObject(IOleInPlaceActiveObject* active, LPCOLESTR name) override;
    STDMETHODIMP InsertMenus(HMENU, OLEMENUGROUPWIDTHS*) override { return E_NOTIMPL; }
    STDMETHODIMP SetMenu(HMENU, HOLEMENU, HWND) override { return E_NOTIMPL; }
    STDMETHODIMP RemoveMenus(HMENU) override { return E_NOTIMPL; }
    STDMETHODIMP SetStatusText(LPCOLESTR) override { return S_OK; }
    STDMETHODIMP EnableModeless(BOOL enable) override {
        mModal += enable ? -1 : 1;
        return heard(enable ? "EnableModeless" : "EnableModeless(not)");
    }
    STDMETHODIMP TranslateAccelerator(MSG*, WORD) override { return S_FALSE; }

    // The control's site
    STDMETHODIMP OnControlInfoChanged() override { return heard("OnControlInfoChanged"); }
    STDMETHODIMP LockInPlaceActive(BOOL) override { return E_NOTIMPL; }
    STDMETHODIMP GetExtendedControl(IDispatch**) override { return E_NOTIMPL; }
    STDMETHODIMP TransformCoords(POINTL*, POINTF*, DWORD) override { return E_NOTIMPL; }
    STDMETHODIMP TranslateAccelerator(MSG* message, DWORD modifiers) override;
    STDMETHODIMP OnFocus(BOOL has) override { return heard(has ? "OnFocus" : "OnFocus(lost)"); }
    STDMETHODIMP ShowPropertyFrame() override { return heard("ShowPropertyFrame"); }

    // What is around the control
    STDMETHODIMP GetTypeInfoCount(UINT*) override { return E_NOTIMPL; }
    STDMETHODIMP GetTypeInfo(UINT, LCID, ITypeInfo**) override { return E_NOTIMPL; }
    STDMETHODIMP GetIDsOfNames(REFIID, LPOLESTR*, UINT, LCID, DISPID*) override {
        return E_NOTIMPL;
    }
    STDMETHODIMP Invoke(DISPID id, REFIID, LCID, WORD how, DISPPARAMS*, VARIANT* result, EXCEPINFO*,
                        UINT*) override;

    // Who looks at it
    STDMETHODIMP_(void) OnDataChange(FORMATETC*, STGMEDIUM*) override {}
    STDMETHODIMP_(void) OnViewChange(DWORD, LONG) override { heard("OnViewChange"); }
    STDMETHODIMP_(void) OnRename(IMoniker*) override {}
    STDMETHODIMP_(void) OnSave() override {}
    STDMETHODIMP_(void) OnClose() override { heard("OnClose"); }

private:
    HRESULT heard(const char* call);

    int mReferences = 0;
    int mModal = 0;
    HWND mWindow;
    Held<_Zandor> mControl;
    Held<IOleInPlaceActiveObject> mActive;
    Calls mCalls;
};

/// A query of two tables and a join, bound to a control.
void bindQuery(_Zandor& control);

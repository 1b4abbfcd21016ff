#pragma once

#include <windows.h>

#include <oleauto.h>
#include <wrl/client.h>

#include <stdexcept>
#include <string>

using Microsoft::WRL::ComPtr;

/// Throws where a call has failed, with the words that the object left for it.
inline void check(HRESULT code, const char* what) {
    if (SUCCEEDED(code)) return;
    std::string words = std::string(what) + " failed";
    ComPtr<IErrorInfo> info;
    BSTR said = nullptr;
    if (GetErrorInfo(0, &info) == S_OK && SUCCEEDED(info->GetDescription(&said)) && said)
        for (const wchar_t* unit = said; *unit; ++unit)
            words += *unit < 128 ? static_cast<char>(*unit) : '?';
    SysFreeString(said);
    throw std::runtime_error(words);
}

/// An object by the name that scripts make it by.
template <class Interface>
ComPtr<Interface> create(const wchar_t* name) {
    CLSID id{};
    if (FAILED(CLSIDFromProgID(name, &id)))
        throw std::runtime_error("ZandorControl.dll is not registered: regsvr32 ZandorControl.dll");
    ComPtr<Interface> made;
    check(CoCreateInstance(id, nullptr, CLSCTX_INPROC_SERVER, IID_PPV_ARGS(&made)),
          "Making an object");
    return made;
}

/// An object that came as IDispatch, by its interface.
template <class Interface>
ComPtr<Interface> as(IUnknown* object) {
    ComPtr<Interface> found;
    if (object) object->QueryInterface(IID_PPV_ARGS(&found));
    if (!found) throw std::runtime_error("An object is of another kind");
    return found;
}

/// A text for a call.
class Text {
public:
    Text(const wchar_t* text) : mText(SysAllocString(text)) {}
    Text(const Text&) = delete;
    Text& operator=(const Text&) = delete;
    ~Text() { SysFreeString(mText); }
    operator BSTR() const { return mText; }

private:
    BSTR mText;
};

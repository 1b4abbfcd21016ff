#pragma once

#include "frontends/windows/automation/com/Value.h"

#include <Zandor/windows/Counted.h>

#include <functional>
#include <map>
#include <memory>
#include <string>
#include <vector>

/// An object of a host's own, with nothing but IDispatch: its members are what a test says.
class Scripted final : public zandor::platform::windows::Counted<IDispatch> {
public:
    /// Arguments in their order. The way is one of DISPATCH_.
    using Arguments = std::vector<const VARIANT*>;
    using Member = std::function<zandor::automation::Value(WORD how, const Arguments&)>;
    /// Thrown by a member: the failure that its caller gets.
    struct Failure {
        HRESULT code;
        std::u16string text;
    };

    static zandor::automation::Held<Scripted> make() {
        return zandor::automation::Held<Scripted>(new Scripted);
    }

    /// A member under a name, and a number where it is called by that.
    void have(const wchar_t* name, Member member, DISPID number = DISPID_UNKNOWN);
    /// A value that is read and written.
    void haveText(const wchar_t* name, std::u16string value);
    void haveNumber(const wchar_t* name, double value);
    void haveFlag(const wchar_t* name, bool value);
    void haveObject(const wchar_t* name, IDispatch* value = nullptr);

    // What values are by now
    std::string textAt(const std::wstring& name) const;
    double numberAt(const std::wstring& name) const;
    IDispatch* objectAt(const std::wstring& name) const;

    /// Which members were called: "Count", and "Left=R4" with the kind of what was written.
    std::vector<std::string> calls;

    STDMETHODIMP GetTypeInfoCount(UINT* count) override;
    STDMETHODIMP GetTypeInfo(UINT, LCID, ITypeInfo**) override { return E_NOTIMPL; }
    STDMETHODIMP GetIDsOfNames(REFIID, LPOLESTR* names, UINT count, LCID, DISPID* ids) override;
    STDMETHODIMP Invoke(DISPID id, REFIID, LCID, WORD how, DISPPARAMS* arguments, VARIANT* result,
                        EXCEPINFO* failure, UINT*) override;

private:
    Scripted() = default;
    void haveValue(const wchar_t* name, zandor::automation::Value value);

    struct Row {
        std::wstring name;
        DISPID number;
        Member member;
    };

    std::vector<Row> mRows;
    std::map<std::wstring, std::shared_ptr<zandor::automation::Value>> mValues;
};

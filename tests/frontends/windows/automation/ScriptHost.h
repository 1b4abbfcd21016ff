#pragma once

#include "Scripted.h"

#include <activscp.h>
#include <string>
#include <vector>

/// Runs scripts in one of the system's engines and lends them an object `WScript`, with the members
/// by which the system's own host of scripts connects events to procedures: CreateObject with a
/// prefix, ConnectObject and DisconnectObject. Wine's host refuses a prefix, and its engines are
/// the same.
class ScriptHost {
public:
    /// "VBScript" or "JScript".
    explicit ScriptHost(const wchar_t* language);
    ScriptHost(const ScriptHost&) = delete;
    ScriptHost& operator=(const ScriptHost&) = delete;
    ~ScriptHost();

    /// An object that scripts know by a name; said before they run.
    void lend(const wchar_t* name, IDispatch* object);
    /// Whether it came to its end; why not is `failure`.
    bool run(const std::wstring& script);

    /// What scripts have said by WScript.Echo, in UTF-8.
    const std::vector<std::string>& said() const { return mSaid; }
    /// The line and the words of the last failure.
    const std::string& failure() const;

private:
    class Site;
    struct Link;

    void connect(IDispatch* object, const std::wstring& prefix);
    void disconnect(IDispatch* object);
    zandor::automation::Value callIfThere(const std::wstring& procedure,
                                          const Scripted::Arguments& arguments) const;
    zandor::automation::Value echo(const Scripted::Arguments& arguments);

    zandor::automation::Held<Scripted> mSelf;
    zandor::automation::Held<Site> mSite;
    zandor::automation::Held<IActiveScript> mEngine;
    std::vector<Link> mLinks;
    std::vector<std::string> mSaid;
};

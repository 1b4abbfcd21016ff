#pragma once

#include "frontends/windows/automation/com/Held.h"
#include "frontends/windows/automation/com/ids.h"

#include <control.h>
#include <model.h>

/// The library as a host has it: loaded from its file, and known by its entry points alone.
class Dll {
public:
    static Dll& get();

    HMODULE module() const { return mModule; }
    std::wstring path() const;

    /// An entry point; the test fails where there is none.
    template <class Function>
    Function entry(const char* name) const {
        return reinterpret_cast<Function>(reinterpret_cast<void*>(find(name)));
    }
    bool canUnload() const;

    /// A new object of a class.
    template <class Interface>
    zandor::automation::Held<Interface> make(const GUID& id) const {
        const auto factory = factoryOf(id);
        zandor::automation::Held<Interface> made;
        if (factory) factory->CreateInstance(nullptr, __uuidof(Interface), made.slotOfAny());
        return made;
    }
    zandor::automation::Held<IClassFactory> factoryOf(const GUID& id) const;

private:
    Dll();
    FARPROC find(const char* name) const;

    HMODULE mModule;
};

/// A new control with its traces off.
zandor::automation::Held<_Zandor> newControl();
/// A new query of the ready-made model.
zandor::automation::Held<_ZDQuery> newQuery();

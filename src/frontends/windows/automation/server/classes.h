#pragma once

#include "frontends/windows/automation/com/Held.h"

#include <span>

namespace zandor::automation {

/// A class that hosts make objects of.
struct CreatableClass {
    GUID id;
    /// As scripts write it: "TalvikDBxZandor.Zandor"; nullptr where it is of no use to them.
    const wchar_t* name;
    const wchar_t* title; ///< for people
    const GUID* library;  ///< in which it is declared; nullptr: in none
    Held<IUnknown> (*make)();
    bool isControl = false; ///< whether a form can hold it
};

std::span<const CreatableClass> creatableClasses();

} // namespace zandor::automation

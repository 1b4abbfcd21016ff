#pragma once

#include "frontends/windows/automation/com/Held.h"

#include <span>

namespace zandor::automation {

/// A class that hosts make objects of.
struct CreatableClass {
    GUID id;
    const wchar_t* name;  ///< as scripts write it: "TalvikDBxZandor.Zandor"
    const wchar_t* title; ///< for people
    const GUID* library;  ///< in which it is declared
    Held<IUnknown> (*make)();
    bool isControl = false; ///< whether a form can hold it
};

std::span<const CreatableClass> creatableClasses();

} // namespace zandor::automation

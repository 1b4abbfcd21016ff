#pragma once

#include "frontends/windows/automation/com/Held.h"

#include <string>

namespace zandor::automation {

/// The library as the system has it loaded.
namespace module {

void remember(HINSTANCE instance); ///< as it is loaded
HINSTANCE instance();
std::wstring path(); ///< of its file

/// Of the objects and locks that keep it loaded.
void retain();
void release();
bool isIdle(); ///< whether nothing keeps it

/// A type library within it: 1 is the control's, 2 the query model's. Throws where it cannot be
/// read.
Held<ITypeLib> typeLibrary(int number);
/// What is declared under an id in one of them. Read once.
Held<ITypeInfo> typeInfo(REFGUID id);

} // namespace module

/// Keeps the library loaded for as long as it lives.
class Keeping {
public:
    Keeping() { module::retain(); }
    Keeping(const Keeping&) = delete;
    Keeping& operator=(const Keeping&) = delete;
    ~Keeping() { module::release(); }
};

} // namespace zandor::automation

#include "designer/run/driverFunction.h"

#include <QSqlDatabase>
#include <QSqlDriver>

#include <dlfcn.h>

namespace zandor::designer {

// By the driver and not by the library's name, which says its version: the driver's class is in the
// driver's file, and what that file is bound to is what is looked through.
void* driverFunction(const QSqlDatabase& database, const char* name) {
    Dl_info file;
    const void* const driversClass = *reinterpret_cast<void* const*>(database.driver());
    if (!dladdr(driversClass, &file) || !file.dli_fname) return nullptr;
    void* const library = dlopen(file.dli_fname, RTLD_LAZY | RTLD_NOLOAD);
    if (!library) return nullptr;
    void* const function = dlsym(library, name);
    dlclose(library); // it stays loaded as long as the driver does
    return function;
}

} // namespace zandor::designer

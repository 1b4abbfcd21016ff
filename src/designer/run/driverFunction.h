#pragma once

class QSqlDatabase;

namespace zandor::designer {

/// A function of the library that a database's driver works with, for its own objects: the
/// libraries are the drivers' and not this program's. Nothing where there is none of that name.
void* driverFunction(const QSqlDatabase& database, const char* name);

/// The same, as a pointer to a function; whether there is one.
template <class Function>
bool findInDriver(const QSqlDatabase& database, const char* name, Function& function) {
    function = reinterpret_cast<Function>(driverFunction(database, name));
    return function != nullptr;
}

} // namespace zandor::designer

#pragma once

#include "Host.h"

#include <functional>
#include <memory>
#include <typeindex>

/// The adapters of Python objects. There is one for each object and interface as long as the object
/// is there, so that the control, which now and then compares addresses, knows it again; it does
/// not hold the object. A reference that goes to C++ holds both.
namespace zandor::python {

/// The adapter of an object, made by `make` when there is none of that type. Under the lock.
std::shared_ptr<Host> adapterOf(PyObject* object, std::type_index type,
                                const std::function<std::shared_ptr<Host>()>& make);

/// A Python object and its adapter for as long as C++ refers to it.
class Kept {
public:
    Kept(std::shared_ptr<Host> adapter, Object object)
        : mAdapter(std::move(adapter)), mObject(std::move(object)) {}
    Kept(const Kept&) = delete;
    Kept& operator=(const Kept&) = delete;
    ~Kept();

private:
    std::shared_ptr<Host> mAdapter;
    Object mObject;
};

/// A reference that holds an adapter and its object. Under the lock.
template <class Adapter>
std::shared_ptr<Adapter> kept(std::shared_ptr<Adapter> adapter) {
    Adapter* const face = adapter.get();
    return {std::make_shared<Kept>(std::move(adapter), Object::share(face->object())), face};
}

/// A reference to an object of Python as an interface. Under the lock.
template <class Adapter, class Interface>
std::shared_ptr<Interface> adapted(PyObject* object) {
    return kept(std::static_pointer_cast<Adapter>(adapterOf(
        object, typeid(Adapter), [object] { return std::make_shared<Adapter>(object); })));
}

/// While a widget is being destroyed no Python object is let go, for with one may go another, and
/// the widget's own parent among them. Such objects wait until Python runs next.
class Ending {
public:
    static void begin();
    static void end();
};

} // namespace zandor::python

#include "adapters.h"

#include <unordered_map>
#include <vector>

namespace zandor::python {

namespace {

struct Known {
    Object weak; ///< forgets the object when it goes
    std::vector<std::pair<std::type_index, std::shared_ptr<Host>>> adapters;
};

// Never destroyed: the interpreter may end before the program's own data do.
std::unordered_map<PyObject*, Known>& known() {
    static auto& all = *new std::unordered_map<PyObject*, Known>;
    return all;
}

struct Waiting {
    std::shared_ptr<Host> adapter;
    Object object;
};
std::vector<Waiting>& waiting() {
    static auto& all = *new std::vector<Waiting>;
    return all;
}
int endings = 0;
bool asked = false; ///< whether Python will call letGo

PyObject* forget(PyObject* address, PyObject*) {
    known().erase(static_cast<PyObject*>(PyLong_AsVoidPtr(address)));
    Py_RETURN_NONE;
}
PyMethodDef forgetting = {"forget", forget, METH_O, nullptr};

void ask();

int letGo(void*) {
    asked = false;
    if (endings > 0)
        ask();
    else
        std::exchange(waiting(), {}); // runs Python, which may have more to let go
    return 0;
}

void ask() {
    if (!asked) asked = Py_AddPendingCall(letGo, nullptr) == 0;
}

} // namespace

std::shared_ptr<Host> adapterOf(PyObject* object, std::type_index type,
                                const std::function<std::shared_ptr<Host>()>& make) {
    auto found = known().find(object);
    if (found == known().end()) {
        const Object address = Object::take(PyLong_FromVoidPtr(object));
        const Object callback = Object::take(PyCFunction_New(&forgetting, address.get()));
        Known one;
        one.weak = Object::take(PyWeakref_NewRef(object, callback.get()));
        found = known().emplace(object, std::move(one)).first;
    }
    auto& adapters = found->second.adapters;
    for (const auto& [known, adapter] : adapters)
        if (known == type) return adapter;
    return adapters.emplace_back(type, make()).second;
}

Kept::~Kept() {
    if (endings == 0 || !Py_IsInitialized()) return;
    const Gil gil;
    waiting().push_back({std::move(mAdapter), std::move(mObject)});
    ask();
}

void Ending::begin() { ++endings; }
void Ending::end() { --endings; }

} // namespace zandor::python

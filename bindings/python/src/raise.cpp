#include "raise.h"

#include "PythonError.h"
#include "conversions.h"

namespace zandor::python {

void raise(const char* type, const model::Message& message, const platform::String& reason) {
    const Gil gil;
    const Object error = ofPackage("errors", type);
    const Object code = toPython(platform::fromUtf8(message.code()));
    const Object value = Object::take(PyObject_CallFunctionObjArgs(
        error.get(), toPython(message.text()).get(), code.get(), toPython(reason).get(), nullptr));
    PyErr_SetObject(error.get(), value.get());
    throwPythonError();
}

} // namespace zandor::python

#include "sipAPI_zandor.h"

#include "PythonError.h"
#include "conversions.h"
#include "names.h"
#include "qvariants.h"

#include <QVariant>

namespace zandor::python {

namespace {

template <class Reference>
bool takeFrom(const QVariant& variant, PyObject** result) {
    if (variant.metaType() != QMetaType::fromType<Reference>()) return false;
    try {
        *result = toPython(variant.value<Reference>()).release();
    } catch (...) {
        setPythonError();
        *result = nullptr;
    }
    return true;
}

template <class Object>
bool putInto(QVariant& variant, PyObject* object, bool* success) {
    if (object == Py_None || !refersTo<Object>(object)) return false;
    try {
        variant = QVariant::fromValue(referenceTo<Object>(object, "the object"));
        *success = true;
    } catch (...) {
        setPythonError();
        *success = false;
    }
    return true;
}

bool fromVariant(const QVariant& variant, PyObject** result) {
    return takeFrom<ZandorModel>(variant, result) || takeFrom<ZDTable>(variant, result) ||
           takeFrom<ZDColumn>(variant, result) || takeFrom<ZDJoin>(variant, result) ||
           takeFrom<ZDColumnDefinition>(variant, result);
}

bool toVariant(PyObject* object, QVariant& variant, bool* success) {
    return putInto<TalvikZandorLib::Zandor>(variant, object, success) ||
           putInto<TalvikZandorLib::ZDTable>(variant, object, success) ||
           putInto<TalvikZandorLib::ZDColumn>(variant, object, success) ||
           putInto<TalvikZandorLib::ZDJoin>(variant, object, success) ||
           putInto<TalvikZandorLib::ZDColumnDefinition>(variant, object, success);
}

template <class Function>
void registerWith(const char* symbol, Function function) {
    if (auto* const enlist = reinterpret_cast<void (*)(Function)>(sipImportSymbol(symbol)))
        enlist(function);
}

} // namespace

void registerQVariants() {
    registerWith("pyqt6_register_from_qvariant_convertor", fromVariant);
    registerWith("pyqt6_register_to_qvariant_convertor", toVariant);
}

} // namespace zandor::python

#include <Zandor/platform/RuntimeError.h>

#include <exception>
#include <new>

namespace zandor::platform {

namespace errors {

RuntimeError invalidProcedureCall() { return {5, u"Invalid procedure call or argument"}; }
RuntimeError overflow() { return {6, u"Overflow"}; }
RuntimeError outOfMemory() { return {7, u"Out of memory"}; }
RuntimeError subscriptOutOfRange() { return {9, u"Subscript out of range"}; }
RuntimeError divisionByZero() { return {11, u"Division by zero"}; }
RuntimeError typeMismatch() { return {13, u"Type mismatch"}; }
RuntimeError objectNotSet() { return {91, u"Object variable or With block variable not set"}; }
RuntimeError noSuchElement(std::int32_t index) {
    return {340, u"Control array element '" + decimal(index) + u"' doesn't exist"};
}
RuntimeError alreadyLoaded() { return {360, u"Object already loaded"}; }
RuntimeError cannotUnloadDesignElement() {
    return {362, u"Can't unload controls created at design time"};
}
RuntimeError invalidPropertyValue() { return {380, u"Invalid property value"}; }
RuntimeError invalidPropertyArrayIndex() { return {381, u"Invalid property array index"}; }
RuntimeError unsupportedMember() {
    return {438, u"Object doesn't support this property or method"};
}
RuntimeError automation(StringView description) { return {440, String(description)}; }
RuntimeError wrongNumberOfArguments() {
    return {450, u"Wrong number of arguments or invalid property assignment"};
}
RuntimeError duplicateKey() {
    return {457, u"This key is already associated with an element of this collection"};
}
RuntimeError invalidRow() { return {30009, u"Invalid Row value"}; }
RuntimeError invalidCol() { return {30010, u"Invalid Col value"}; }

} // namespace errors

RuntimeError currentError() {
    try {
        throw;
    } catch (const RuntimeError& error) {
        return error;
    } catch (const std::bad_alloc&) {
        return errors::outOfMemory();
    } catch (const std::exception& error) {
        return errors::automation(fromUtf8(error.what()));
    } catch (...) {
        return errors::automation(u"Automation error");
    }
}

} // namespace zandor::platform

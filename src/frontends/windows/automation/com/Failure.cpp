#include "frontends/windows/automation/com/Failure.h"

#include "frontends/windows/automation/com/Held.h"
#include "frontends/windows/automation/com/Text.h"

namespace zandor::automation {

namespace {

using platform::RuntimeError;

/// The system's words, in one line; or the classic runtime's, where the system has none.
platform::String wordsOf(HRESULT code) {
    wchar_t words[512];
    DWORD length =
        FormatMessageW(FORMAT_MESSAGE_FROM_SYSTEM | FORMAT_MESSAGE_IGNORE_INSERTS, nullptr,
                       static_cast<DWORD>(code), 0, words, DWORD{std::size(words)}, nullptr);
    while (length > 0 && words[length - 1] <= L' ') --length;
    if (length == 0) return u"Automation error";
    return {reinterpret_cast<const char16_t*>(words), length};
}

/// What an object left behind for a failure of its own.
Held<IErrorInfo> wordsLeft(IUnknown* object, REFIID iid) {
    const auto leaves = Held<ISupportErrorInfo>::of(object);
    Held<IErrorInfo> words;
    if (!leaves || leaves->InterfaceSupportsErrorInfo(iid) != S_OK) return {};
    if (GetErrorInfo(0, words.slot()) != S_OK) return {};
    return words;
}

} // namespace

RuntimeError errorOf(HRESULT code) {
    using namespace platform::errors;
    switch (code) {
    case E_INVALIDARG: return invalidProcedureCall();
    case E_OUTOFMEMORY: return outOfMemory();
    case E_NOINTERFACE:
    case DISP_E_BADVARTYPE:
    case DISP_E_TYPEMISMATCH: return typeMismatch();
    case DISP_E_OVERFLOW: return overflow();
    case DISP_E_BADINDEX: return subscriptOutOfRange();
    case DISP_E_DIVBYZERO: return divisionByZero();
    case DISP_E_UNKNOWNNAME:
    case DISP_E_MEMBERNOTFOUND: return unsupportedMember();
    case DISP_E_BADPARAMCOUNT: return wrongNumberOfArguments();
    default: break;
    }
    if (HRESULT_FACILITY(code) == FACILITY_CONTROL) {
        const auto number = static_cast<std::int32_t>(HRESULT_CODE(code));
        for (const RuntimeError& known :
             {invalidProcedureCall(), overflow(), outOfMemory(), subscriptOutOfRange(),
              divisionByZero(), typeMismatch(), objectNotSet(), invalidPropertyValue(),
              invalidPropertyArrayIndex(), unsupportedMember(), wrongNumberOfArguments(),
              duplicateKey()})
            if (known.Number == number) return known;
        return {number, u"Automation error"};
    }
    return {static_cast<std::int32_t>(code), wordsOf(code)};
}

void require(HRESULT code, IUnknown* object, REFIID iid) {
    if (SUCCEEDED(code)) return;
    if (const auto words = wordsLeft(object, iid)) {
        Text text;
        if (SUCCEEDED(words->GetDescription(text.slot())) && text.get())
            throw RuntimeError{errorOf(code).Number, text.string()};
    }
    throw errorOf(code);
}

HRESULT leave(const RuntimeError& error) {
    const HRESULT code = codeOf(error.Number);
    Held<ICreateErrorInfo> words;
    if (FAILED(CreateErrorInfo(words.slot()))) return code;
    platform::String description = error.Description;
    platform::String source = u"TalvikDBxZandor.Zandor";
    words->SetDescription(reinterpret_cast<LPOLESTR>(description.data()));
    words->SetSource(reinterpret_cast<LPOLESTR>(source.data()));
    SetErrorInfo(0, Held<IErrorInfo>::of(words.get()).get());
    return code;
}

} // namespace zandor::automation

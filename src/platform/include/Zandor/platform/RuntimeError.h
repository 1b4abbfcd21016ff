#pragma once

#include <Zandor/platform/String.h>
#include <Zandor/platform/export.h>

namespace zandor::platform {

/// The one exception type of the control. Numbers and descriptions are the classic runtime's.
struct ZANDOR_CONTROL_EXPORT RuntimeError {
    std::int32_t Number = 0; ///< of the list in docs/architecture.md
    String Description;      ///< one line, in English
};

namespace errors {

ZANDOR_CONTROL_EXPORT RuntimeError invalidProcedureCall(); ///< 5, also: no such key in a collection
ZANDOR_CONTROL_EXPORT RuntimeError overflow();             ///< 6
ZANDOR_CONTROL_EXPORT RuntimeError outOfMemory();          ///< 7
ZANDOR_CONTROL_EXPORT RuntimeError subscriptOutOfRange();  ///< 9
ZANDOR_CONTROL_EXPORT RuntimeError divisionByZero();       ///< 11
ZANDOR_CONTROL_EXPORT RuntimeError typeMismatch();         ///< 13
ZANDOR_CONTROL_EXPORT RuntimeError objectNotSet();         ///< 91
ZANDOR_CONTROL_EXPORT RuntimeError noSuchElement(std::int32_t index); ///< 340
ZANDOR_CONTROL_EXPORT RuntimeError alreadyLoaded();                   ///< 360
ZANDOR_CONTROL_EXPORT RuntimeError cannotUnloadDesignElement();       ///< 362
ZANDOR_CONTROL_EXPORT RuntimeError invalidPropertyValue();            ///< 380
ZANDOR_CONTROL_EXPORT RuntimeError invalidPropertyArrayIndex();       ///< 381
ZANDOR_CONTROL_EXPORT RuntimeError unsupportedMember();               ///< 438
ZANDOR_CONTROL_EXPORT RuntimeError
automation(StringView description);                          ///< 440, a host's own exception
ZANDOR_CONTROL_EXPORT RuntimeError wrongNumberOfArguments(); ///< 450
ZANDOR_CONTROL_EXPORT RuntimeError duplicateKey();           ///< 457
ZANDOR_CONTROL_EXPORT RuntimeError invalidRow();             ///< 30009
ZANDOR_CONTROL_EXPORT RuntimeError invalidCol();             ///< 30010

} // namespace errors

/// The exception being handled as a RuntimeError: its own when it is one, 7 for a failed
/// allocation, 440 with the exception's text for anything else. Call inside a catch block.
ZANDOR_CONTROL_EXPORT RuntimeError currentError();

} // namespace zandor::platform

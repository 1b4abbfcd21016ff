#pragma once

#include <Zandor/platform/String.h>

namespace zandor::platform {

/// The one exception type of the control. Numbers and descriptions are the classic runtime's.
struct RuntimeError {
    std::int32_t Number = 0;
    String Description;
};

namespace errors {

RuntimeError invalidProcedureCall();             ///< 5, also: no such key in a collection
RuntimeError overflow();                         ///< 6
RuntimeError outOfMemory();                      ///< 7
RuntimeError subscriptOutOfRange();              ///< 9
RuntimeError divisionByZero();                   ///< 11
RuntimeError typeMismatch();                     ///< 13
RuntimeError objectNotSet();                     ///< 91
RuntimeError noSuchElement(std::int32_t index);  ///< 340
RuntimeError alreadyLoaded();                    ///< 360
RuntimeError cannotUnloadDesignElement();        ///< 362
RuntimeError invalidPropertyValue();             ///< 380
RuntimeError invalidPropertyArrayIndex();        ///< 381
RuntimeError unsupportedMember();                ///< 438
RuntimeError automation(StringView description); ///< 440, a host's own exception
RuntimeError wrongNumberOfArguments();           ///< 450
RuntimeError duplicateKey();                     ///< 457
RuntimeError invalidRow();                       ///< 30009
RuntimeError invalidCol();                       ///< 30010

} // namespace errors

/// The exception being handled as a RuntimeError: its own when it is one, 7 for a failed
/// allocation, 440 with the exception's text for anything else. Call inside a catch block.
RuntimeError currentError();

} // namespace zandor::platform

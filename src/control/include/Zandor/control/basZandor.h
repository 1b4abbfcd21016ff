#pragma once

#include <Zandor/control/Life.h>
#include <Zandor/platform/export.h>

namespace TalvikDBxZandor::basZandor {

inline constexpr platform::StringView ModuleName = u"TalvikDBxZandor.basZandor";

/// Shows the unexpected-error box and returns when the user has closed it.
ZANDOR_CONTROL_EXPORT void ReportError(platform::MessageBoxes& boxes,
                                       const platform::RuntimeError& error,
                                       platform::StringView moduleName,
                                       platform::StringView procedureName);

/// Shows the debug box, whatever DebugSwitch says: the caller decides.
ZANDOR_CONTROL_EXPORT void DebugMessage(platform::MessageBoxes& boxes, platform::StringView message,
                                        platform::StringView moduleName,
                                        platform::StringView procedureName);

/// Reports the exception being handled; a failure of the report itself ends the report.
ZANDOR_CONTROL_EXPORT void ReportCurrentError(platform::MessageBoxes& boxes,
                                              platform::StringView moduleName,
                                              platform::StringView procedureName) noexcept;

/// Runs the body of a procedure. Whatever it throws is reported once under the procedure's name,
/// and the rest of the body is skipped; the caller is not told. What the body works for being gone
/// is nothing to report.
template <class Body>
void Guard(platform::MessageBoxes& boxes, platform::StringView moduleName,
           platform::StringView procedureName, Body&& body) noexcept {
    try {
        body();
    } catch (const Gone&) {
    } catch (...) {
        ReportCurrentError(boxes, moduleName, procedureName);
    }
}

/// The cell of a point in the grid's coordinates (twips). A failure of the grid is reported; what
/// had not been found by then keeps its value.
ZANDOR_CONTROL_EXPORT void SpreadHitTest(platform::MessageBoxes& boxes, std::int32_t& Col,
                                         std::int32_t& Row, const MSFlexGridLib::MSFlexGrid& grid,
                                         float X, float Y);

} // namespace TalvikDBxZandor::basZandor

#include <Zandor/control/basZandor.h>

namespace TalvikDBxZandor::basZandor {

using platform::String;
using platform::StringView;

namespace {

String labelled(StringView label, StringView text) {
    String line(label);
    line += u'\t';
    line += text;
    return line;
}

String origin(StringView moduleName, StringView procedureName) {
    return labelled(u"Module:", moduleName) + u"\r\n" + labelled(u"Function:", procedureName) +
           u"\r\n";
}

} // namespace

void ReportError(platform::MessageBoxes& boxes, const platform::RuntimeError& error,
                 StringView moduleName, StringView procedureName) {
    boxes.MsgBox(origin(moduleName, procedureName) +
                     labelled(u"Error No:", platform::decimal(error.Number)) + u"\r\n" +
                     labelled(u"Error:", error.Description),
                 platform::styleExclamation, u"Unexpected Error:");
}

void DebugMessage(platform::MessageBoxes& boxes, StringView message, StringView moduleName,
                  StringView procedureName) {
    boxes.MsgBox(origin(moduleName, procedureName) + labelled(u"Message:", message),
                 platform::styleExclamation, u"Debug Message:");
}

void ReportCurrentError(platform::MessageBoxes& boxes, StringView moduleName,
                        StringView procedureName) noexcept {
    try {
        ReportError(boxes, platform::currentError(), moduleName, procedureName);
    } catch (...) {
        // The report failed too: there is nobody left to tell, and the procedure ends all the same.
    }
}

void SpreadHitTest(platform::MessageBoxes& boxes, std::int32_t& Col, std::int32_t& Row,
                   const MSFlexGridLib::MSFlexGrid& grid, float X, float Y) {
    Guard(boxes, ModuleName, u"SpreadHitTest", [&] {
        std::int32_t i = grid.LeftCol();
        while (i < grid.Cols() && !(X < grid.ColPos(i))) ++i;
        Col = i < grid.Cols() ? i - 1 : grid.Cols() - 1;

        i = grid.TopRow();
        while (i < grid.Rows() && !(Y < grid.RowPos(i))) ++i;
        Row = i < grid.Rows() ? i - 1 : grid.Rows() - 1;
    });
}

} // namespace TalvikDBxZandor::basZandor

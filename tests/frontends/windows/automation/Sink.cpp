#include "Sink.h"

#include "frontends/windows/automation/com/ids.h"

#include <gtest/gtest.h>

using namespace zandor;
using namespace zandor::automation;

namespace {

std::string spoken(const VARIANT& value) {
    if (value.vt == VT_DISPATCH) return value.pdispVal ? "object" : "nothing";
    return platform::toUtf8(stringOf(value));
}

} // namespace

Sink::Sink(IUnknown* control) : mObject(Scripted::make()) {
    for (DISPID event = -120; event >= -129; --event)
        mObject->have(
            L"event",
            [this, event, heard = mHeard](WORD, const Scripted::Arguments& arguments) {
                std::string call = std::to_string(event) + "(";
                for (const VARIANT* argument : arguments)
                    call += (call.back() == '(' ? "" : ", ") + spoken(*argument);
                heard->push_back(call + ")");
                if (then) std::exchange(then, {})();
                return Value();
            },
            event);
    const auto points = Held<IConnectionPointContainer>::of(control);
    EXPECT_EQ(points->FindConnectionPoint(ids::controlEvents, mPoint.slot()), S_OK);
    EXPECT_EQ(mPoint->Advise(mObject.get(), &mCookie), S_OK);
}

void Sink::unadvise() {
    if (mPoint) mPoint->Unadvise(mCookie);
    mPoint = {};
}

#pragma once

namespace TalvikDBxZandor {

/// Gives a control the focus if it can take it. One that is not on the screen yet, or no longer
/// because its window was closed, cannot and need not.
template <class Focusable>
void offerFocus(Focusable& control) {
    try {
        control.SetFocus();
    } catch (...) {
        // There is nothing to report: the focus stays where it is.
    }
}

} // namespace TalvikDBxZandor

#pragma once

#include <ostream>

/// Where around the control something is set that widgets inherit, and whether that is before the
/// control is shown with a query or after.
enum class Where { application, window, widget };
enum class When { before, after };

struct Case {
    Where where;
    When when;
};

inline constexpr Case everywhere[] = {
    {Where::application, When::before}, {Where::application, When::after},
    {Where::window, When::before},      {Where::window, When::after},
    {Where::widget, When::before},      {Where::widget, When::after},
};

inline void PrintTo(const Case& c, std::ostream* out) {
    *out << (c.where == Where::application ? "the application"
             : c.where == Where::window    ? "the window"
                                           : "the widget")
         << (c.when == When::before ? " before the query" : " after the query");
}

#pragma once

#include "support/FakeModel.h"

/// The tables of many tests, side by side on the canvas.

inline zandor::platform::Ref<fake::Table> addOrders(fake::Model& model) {
    auto orders = model.table(u"ORDERS", {u"*", u"ID", u"CUSTOMER", u"TOTAL"});
    orders->place(300, 300, 2400, 2400);
    return orders;
}

inline zandor::platform::Ref<fake::Table> addCustomers(fake::Model& model) {
    auto customers = model.table(u"CUSTOMERS", {u"*", u"ID", u"NAME"});
    customers->place(6000, 300, 2400, 2400);
    return customers;
}

inline zandor::platform::Ref<fake::Table> addParts(fake::Model& model) {
    auto parts = model.table(u"PARTS", {u"*", u"NO", u"TITLE"});
    parts->place(9000, 300, 2100, 2400);
    return parts;
}

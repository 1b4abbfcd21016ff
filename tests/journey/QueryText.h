#pragma once

#include <Zandor/Query.h>

#include <QString>

/// What a query is, a line for each table, join and output column:
///
///     table orders
///     join orders.customer_id = customers.id, type 0
///     column orders.id 'synonym' sort 0 visible total sum [= 1]
///     column (none) '' sort 0 visible expression quantity * 2
QString textOf(zandor::model::Query& query);

#pragma once

#include <Zandor/TalvikZandorLib.h>

#include <QString>

namespace zandor::designer {

/// "orders.total"; what is left of it when the column is no longer in the query.
QString wordsFor(const platform::Ref<TalvikZandorLib::ZDColumnDefinition>& definition);

/// "orders.customer_id = customers.id".
QString wordsFor(const platform::Ref<TalvikZandorLib::ZDJoin>& join);

} // namespace zandor::designer

#pragma once

#include <Zandor/Query.h>

#include <QStringList>

/// The query that the sample database opens with: large orders from two countries, the oldest
/// first.
namespace zandor::designer {

QStringList exampleTables();

/// Places tables from left to right, as the joins run.
void placeInARow(const std::vector<platform::Ref<model::Table>>& tables);

/// Adds the output columns to a query over the example's tables; what names a column that is not
/// there is left out.
void addExampleColumns(model::Query& query);

} // namespace zandor::designer

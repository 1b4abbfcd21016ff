#pragma once

#include <Zandor/DatabaseReader.h>
#include <Zandor/SqlReader.h>

/// What a statement may name: the tables of a database, each read once. The reader must outlive it.
zandor::sql_reader::Schema schemaOf(zandor::reader::DatabaseReader& database);

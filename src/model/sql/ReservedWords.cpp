#include "model/sql/ReservedWords.h"

#include <algorithm>
#include <iterator>

namespace zandor::model::sql {

namespace {

// In order, for the binary search.
// clang-format off
constexpr platform::StringView words[] = {
    u"abort", u"abs", u"accessible", u"acos", u"action", u"add", u"after", u"all", u"allocate",
    u"alter", u"always", u"analyse", u"analyze", u"and", u"any", u"are", u"array", u"array_agg",
    u"array_max_cardinality", u"as", u"asc", u"asensitive", u"asin", u"asymmetric", u"at", u"atan",
    u"atomic", u"attach", u"authorization", u"autoincrement", u"avg", u"backup", u"before",
    u"begin", u"begin_frame", u"begin_partition", u"between", u"bigint", u"binary", u"blob",
    u"boolean", u"both", u"break", u"browse", u"bulk", u"by", u"call", u"called", u"cardinality",
    u"cascade", u"cascaded", u"case", u"cast", u"ceil", u"ceiling", u"change", u"char",
    u"char_length", u"character", u"character_length", u"check", u"checkpoint", u"classifier",
    u"clob", u"close", u"clustered", u"coalesce", u"collate", u"collation", u"collect", u"column",
    u"commit", u"compute", u"concurrently", u"condition", u"conflict", u"connect", u"constraint",
    u"contains", u"containstable", u"continue", u"convert", u"copy", u"corr", u"corresponding",
    u"cos", u"cosh", u"count", u"covar_pop", u"covar_samp", u"create", u"cross", u"cube",
    u"cume_dist", u"current", u"current_catalog", u"current_date",
    u"current_default_transform_group", u"current_path", u"current_role", u"current_row",
    u"current_schema", u"current_time", u"current_timestamp", u"current_transform_group_for_type",
    u"current_user", u"cursor", u"cycle", u"database", u"databases", u"date", u"day", u"day_hour",
    u"day_microsecond", u"day_minute", u"day_second", u"dbcc", u"deallocate", u"dec", u"decfloat",
    u"decimal", u"declare", u"default", u"deferrable", u"deferred", u"define", u"delayed",
    u"delete", u"delete_domain_id", u"dense_rank", u"deny", u"deref", u"desc", u"describe",
    u"detach", u"deterministic", u"disconnect", u"disk", u"distinct", u"distinctrow",
    u"distributed", u"div", u"do", u"do_domain_ids", u"double", u"drop", u"dual", u"dump",
    u"dynamic", u"each", u"element", u"else", u"elseif", u"empty", u"enclosed", u"end",
    u"end_frame", u"end_partition", u"equals", u"errlvl", u"escape", u"escaped", u"every",
    u"except", u"exclude", u"exclusive", u"exec", u"execute", u"exists", u"exit", u"exp",
    u"explain", u"external", u"extract", u"fail", u"false", u"fetch", u"file", u"fillfactor",
    u"filter", u"first", u"first_value", u"float", u"float4", u"float8", u"floor", u"following",
    u"for", u"force", u"foreign", u"frame_row", u"free", u"freetext", u"freetexttable", u"freeze",
    u"from", u"full", u"fulltext", u"function", u"fusion", u"generated", u"get", u"glob", u"global",
    u"go", u"goto", u"grant", u"greatest", u"group", u"grouping", u"groups", u"having",
    u"high_priority", u"hold", u"holdlock", u"hour", u"hour_microsecond", u"hour_minute",
    u"hour_second", u"identity", u"identity_insert", u"identitycol", u"if", u"ignore",
    u"ignore_domain_ids", u"ilike", u"immediate", u"in", u"index", u"indexed", u"indicator",
    u"infile", u"initial", u"initially", u"inner", u"inout", u"insensitive", u"insert", u"instead",
    u"int", u"int1", u"int2", u"int3", u"int4", u"int8", u"integer", u"intersect", u"intersection",
    u"interval", u"into", u"io_after_gtids", u"io_before_gtids", u"is", u"isnull", u"iterate",
    u"join", u"json_array", u"json_arrayagg", u"json_exists", u"json_object", u"json_objectagg",
    u"json_query", u"json_table", u"json_table_primitive", u"json_value", u"key", u"keys", u"kill",
    u"lag", u"language", u"large", u"last", u"last_value", u"lateral", u"lead", u"leading",
    u"least", u"leave", u"left", u"library", u"like", u"like_regex", u"limit", u"linear", u"lineno",
    u"lines", u"listagg", u"ln", u"load", u"local", u"localtime", u"localtimestamp", u"lock",
    u"log", u"log10", u"long", u"longblob", u"longtext", u"loop", u"low_priority", u"lower",
    u"manual", u"master_bind", u"master_heartbeat_period", u"master_ssl_verify_server_cert",
    u"match", u"match_number", u"match_recognize", u"matches", u"materialized", u"max", u"maxvalue",
    u"mediumblob", u"mediumint", u"mediumtext", u"member", u"merge", u"method", u"middleint",
    u"min", u"minute", u"minute_microsecond", u"minute_second", u"mod", u"modifies", u"module",
    u"month", u"multiset", u"national", u"natural", u"nchar", u"nclob", u"new", u"no",
    u"no_write_to_binlog", u"nocheck", u"nonclustered", u"none", u"normalize", u"not", u"nothing",
    u"notnull", u"nth_value", u"ntile", u"null", u"nullif", u"nulls", u"numeric",
    u"occurrences_regex", u"octet_length", u"of", u"off", u"offset", u"offsets", u"oid", u"old",
    u"omit", u"on", u"one", u"only", u"open", u"opendatasource", u"openquery", u"openrowset",
    u"openxml", u"optimize", u"option", u"optionally", u"or", u"order", u"others", u"out", u"outer",
    u"outfile", u"over", u"overlaps", u"overlay", u"page_checksum", u"parallel", u"parameter",
    u"parse_vcol_expr", u"partition", u"pattern", u"per", u"percent", u"percent_rank",
    u"percentile_cont", u"percentile_disc", u"period", u"pivot", u"placing", u"plan", u"portion",
    u"position", u"position_regex", u"power", u"pragma", u"precedes", u"preceding", u"precision",
    u"prepare", u"primary", u"print", u"proc", u"procedure", u"ptf", u"public", u"purge",
    u"qualify", u"query", u"raise", u"raiserror", u"range", u"rank", u"read", u"read_write",
    u"reads", u"readtext", u"real", u"reconfigure", u"recursive", u"ref", u"ref_system_id",
    u"references", u"referencing", u"regexp", u"regr_avgx", u"regr_avgy", u"regr_count",
    u"regr_intercept", u"regr_r2", u"regr_slope", u"regr_sxx", u"regr_sxy", u"regr_syy", u"reindex",
    u"release", u"rename", u"repeat", u"replace", u"replication", u"require", u"resignal",
    u"restore", u"restrict", u"result", u"return", u"returning", u"returns", u"revert", u"revoke",
    u"right", u"rlike", u"rollback", u"rollup", u"row", u"row_number", u"rowcount", u"rowguidcol",
    u"rowid", u"rows", u"rule", u"running", u"save", u"savepoint", u"schema", u"schemas", u"scope",
    u"scroll", u"search", u"second", u"second_microsecond", u"securityaudit", u"seek", u"select",
    u"semantickeyphrasetable", u"sensitive", u"separator", u"session_user", u"set", u"setof",
    u"setuser", u"show", u"shutdown", u"signal", u"similar", u"sin", u"sinh", u"skip", u"slow",
    u"smallint", u"some", u"spatial", u"specific", u"specifictype", u"sql", u"sql_big_result",
    u"sql_calc_found_rows", u"sql_small_result", u"sqlexception", u"sqlstate", u"sqlwarning",
    u"sqrt", u"ssl", u"start", u"starting", u"static", u"statistics", u"stats_auto_recalc",
    u"stats_persistent", u"stats_sample_pages", u"stddev_pop", u"stddev_samp", u"stored",
    u"straight_join", u"submultiset", u"subset", u"substring", u"substring_regex", u"succeeds",
    u"sum", u"symmetric", u"system", u"system_time", u"system_user", u"table", u"tablesample",
    u"tan", u"tanh", u"temp", u"temporary", u"terminated", u"textsize", u"then", u"ties", u"time",
    u"timestamp", u"timezone_hour", u"timezone_minute", u"tinyblob", u"tinyint", u"tinytext", u"to",
    u"top", u"trailing", u"tran", u"transaction", u"translate", u"translate_regex", u"translation",
    u"treat", u"trigger", u"trim", u"trim_array", u"true", u"truncate", u"try_convert", u"tsequal",
    u"uescape", u"unbounded", u"undo", u"union", u"unique", u"unknown", u"unlock", u"unnest",
    u"unpivot", u"unsigned", u"update", u"updatetext", u"upper", u"usage", u"use", u"user",
    u"using", u"utc_date", u"utc_time", u"utc_timestamp", u"vacuum", u"value", u"value_of",
    u"values", u"var_pop", u"var_samp", u"varbinary", u"varchar", u"varcharacter", u"variadic",
    u"varying", u"verbose", u"versioning", u"view", u"virtual", u"waitfor", u"when", u"whenever",
    u"where", u"while", u"width_bucket", u"window", u"with", u"within", u"without", u"write",
    u"writetext", u"xor", u"year", u"year_month", u"zerofill", u"zone",
};
// clang-format on

static_assert(std::is_sorted(std::begin(words), std::end(words)));

} // namespace

bool isReserved(platform::StringView word) {
    platform::String lower(word);
    for (char16_t& c : lower)
        if (c >= u'A' && c <= u'Z') c = static_cast<char16_t>(c + (u'a' - u'A'));
    return std::binary_search(std::begin(words), std::end(words), platform::StringView(lower));
}

} // namespace zandor::model::sql

#include "model/sql/ReservedWords.h"

#include <algorithm>
#include <iterator>

namespace zandor::model::sql {

namespace {

// In order, for the binary search.
// clang-format off

// Of SQLite 3.40, which takes most of its keywords for names where one has to stand.
constexpr StringView sqlite[] = {
    u"add", u"all", u"alter", u"and", u"as", u"autoincrement", u"between", u"case", u"cast",
    u"check", u"collate", u"commit", u"constraint", u"create", u"current_date", u"current_time",
    u"current_timestamp", u"default", u"deferrable", u"delete", u"distinct", u"drop", u"else",
    u"escape", u"except", u"exists", u"foreign", u"from", u"group", u"having", u"in", u"index",
    u"insert", u"intersect", u"into", u"is", u"isnull", u"join", u"limit", u"not", u"nothing",
    u"notnull", u"null", u"on", u"or", u"order", u"primary", u"raise", u"references", u"returning",
    u"select", u"set", u"table", u"then", u"to", u"transaction", u"union", u"unique", u"update",
    u"using", u"values", u"when", u"where",
};

// Of PostgreSQL 15: those that pg_get_keywords() calls reserved.
constexpr StringView postgres[] = {
    u"all", u"analyse", u"analyze", u"and", u"any", u"array", u"as", u"asc", u"asymmetric",
    u"authorization", u"binary", u"both", u"case", u"cast", u"check", u"collate", u"collation",
    u"column", u"concurrently", u"constraint", u"create", u"cross", u"current_catalog",
    u"current_date", u"current_role", u"current_schema", u"current_time", u"current_timestamp",
    u"current_user", u"default", u"deferrable", u"desc", u"distinct", u"do", u"else", u"end",
    u"except", u"false", u"fetch", u"for", u"foreign", u"freeze", u"from", u"full", u"grant",
    u"group", u"having", u"ilike", u"in", u"initially", u"inner", u"intersect", u"into", u"is",
    u"isnull", u"join", u"lateral", u"leading", u"left", u"like", u"limit", u"localtime",
    u"localtimestamp", u"natural", u"not", u"notnull", u"null", u"offset", u"on", u"only", u"or",
    u"order", u"outer", u"overlaps", u"placing", u"primary", u"references", u"returning", u"right",
    u"select", u"session_user", u"similar", u"some", u"symmetric", u"table", u"tablesample",
    u"then", u"to", u"trailing", u"true", u"union", u"unique", u"user", u"using", u"variadic",
    u"verbose", u"when", u"where", u"window", u"with",
};

// Of MariaDB 10.11 and of MySQL up to 9: they have a dialect in common. A name with _ before that of
// a character set begins a text in it.
constexpr StringView mysql[] = {
    u"_armscii8", u"_ascii", u"_big5", u"_binary", u"_cp1250", u"_cp1251", u"_cp1256", u"_cp1257",
    u"_cp850", u"_cp852", u"_cp866", u"_cp932", u"_dec8", u"_eucjpms", u"_euckr", u"_gb18030",
    u"_gb2312", u"_gbk", u"_geostd8", u"_greek", u"_hebrew", u"_hp8", u"_keybcs2", u"_koi8r",
    u"_koi8u", u"_latin1", u"_latin2", u"_latin5", u"_latin7", u"_macce", u"_macroman", u"_sjis",
    u"_swe7", u"_tis620", u"_ucs2", u"_ujis", u"_utf16", u"_utf16le", u"_utf32", u"_utf8",
    u"_utf8mb3", u"_utf8mb4", u"accessible", u"add", u"all", u"alter", u"analyze", u"and", u"as",
    u"asc", u"asensitive", u"before", u"between", u"bigint", u"binary", u"blob", u"both", u"by",
    u"call", u"cascade", u"case", u"change", u"char", u"character", u"check", u"collate", u"column",
    u"condition", u"constraint", u"continue", u"convert", u"create", u"cross", u"cube",
    u"cume_dist", u"current_date", u"current_role", u"current_time", u"current_timestamp",
    u"current_user", u"cursor", u"database", u"databases", u"day_hour", u"day_microsecond",
    u"day_minute", u"day_second", u"dec", u"decimal", u"declare", u"default", u"delayed", u"delete",
    u"delete_domain_id", u"dense_rank", u"desc", u"describe", u"deterministic", u"distinct",
    u"distinctrow", u"div", u"do_domain_ids", u"double", u"drop", u"dual", u"each", u"else",
    u"elseif", u"empty", u"enclosed", u"escaped", u"except", u"exists", u"exit", u"explain",
    u"external", u"false", u"fetch", u"first_value", u"float", u"float4", u"float8", u"for",
    u"force", u"foreign", u"from", u"fulltext", u"function", u"generated", u"get", u"grant",
    u"group", u"grouping", u"groups", u"having", u"high_priority", u"hour_microsecond",
    u"hour_minute", u"hour_second", u"if", u"ignore", u"ignore_domain_ids", u"in", u"index",
    u"infile", u"inner", u"inout", u"insensitive", u"insert", u"int", u"int1", u"int2", u"int3",
    u"int4", u"int8", u"integer", u"intersect", u"interval", u"into", u"io_after_gtids",
    u"io_before_gtids", u"is", u"iterate", u"join", u"json_table", u"key", u"keys", u"kill", u"lag",
    u"last_value", u"lateral", u"lead", u"leading", u"leave", u"left", u"library", u"like",
    u"limit", u"linear", u"lines", u"load", u"localtime", u"localtimestamp", u"lock", u"long",
    u"longblob", u"longtext", u"loop", u"low_priority", u"manual", u"master_bind",
    u"master_demote_to_replica", u"master_demote_to_slave", u"master_ssl_verify_server_cert",
    u"match", u"maxvalue", u"mediumblob", u"mediumint", u"mediumtext", u"middleint",
    u"minute_microsecond", u"minute_second", u"mod", u"modifies", u"natural", u"no_write_to_binlog",
    u"not", u"nth_value", u"ntile", u"null", u"numeric", u"of", u"offset", u"on", u"optimize",
    u"optimizer_costs", u"option", u"optionally", u"or", u"order", u"out", u"outer", u"outfile",
    u"over", u"page_checksum", u"parallel", u"parse_vcol_expr", u"partition", u"percent_rank",
    u"portion", u"precision", u"primary", u"procedure", u"purge", u"qualify", u"range", u"rank",
    u"read", u"read_write", u"reads", u"real", u"recursive", u"ref_system_id", u"references",
    u"regexp", u"release", u"rename", u"repeat", u"replace", u"require", u"resignal", u"restrict",
    u"return", u"returning", u"revoke", u"right", u"rlike", u"row", u"row_number", u"rows",
    u"schema", u"schemas", u"second_microsecond", u"select", u"sensitive", u"separator", u"set",
    u"show", u"signal", u"smallint", u"spatial", u"specific", u"sql", u"sql_big_result",
    u"sql_calc_found_rows", u"sql_small_result", u"sqlexception", u"sqlstate", u"sqlwarning",
    u"ssl", u"starting", u"stats_auto_recalc", u"stats_persistent", u"stats_sample_pages",
    u"stored", u"straight_join", u"system", u"table", u"tablesample", u"terminated", u"then",
    u"tinyblob", u"tinyint", u"tinytext", u"to", u"trailing", u"trigger", u"true", u"undo",
    u"union", u"unique", u"unlock", u"unsigned", u"update", u"usage", u"use", u"using", u"utc_date",
    u"utc_time", u"utc_timestamp", u"values", u"varbinary", u"varchar", u"varcharacter", u"varying",
    u"virtual", u"when", u"where", u"while", u"window", u"with", u"write", u"xor", u"year_month",
    u"zerofill",
};

// Of Transact-SQL, as its documentation has them.
constexpr StringView sqlServer[] = {
    u"add", u"all", u"alter", u"and", u"any", u"as", u"asc", u"authorization", u"backup", u"begin",
    u"between", u"break", u"browse", u"bulk", u"by", u"cascade", u"case", u"check", u"checkpoint",
    u"close", u"clustered", u"coalesce", u"collate", u"column", u"commit", u"compute",
    u"constraint", u"contains", u"containstable", u"continue", u"convert", u"create", u"cross",
    u"current", u"current_date", u"current_time", u"current_timestamp", u"current_user", u"cursor",
    u"database", u"dbcc", u"deallocate", u"declare", u"default", u"delete", u"deny", u"desc",
    u"disk", u"distinct", u"distributed", u"double", u"drop", u"dump", u"else", u"end", u"errlvl",
    u"escape", u"except", u"exec", u"execute", u"exists", u"exit", u"external", u"fetch", u"file",
    u"fillfactor", u"for", u"foreign", u"freetext", u"freetexttable", u"from", u"full", u"function",
    u"goto", u"grant", u"group", u"having", u"holdlock", u"identity", u"identity_insert",
    u"identitycol", u"if", u"in", u"index", u"inner", u"insert", u"intersect", u"into", u"is",
    u"join", u"key", u"kill", u"left", u"like", u"lineno", u"load", u"merge", u"national",
    u"nocheck", u"nonclustered", u"not", u"null", u"nullif", u"of", u"off", u"offsets", u"on",
    u"open", u"opendatasource", u"openquery", u"openrowset", u"openxml", u"option", u"or", u"order",
    u"outer", u"over", u"percent", u"pivot", u"plan", u"precision", u"primary", u"print", u"proc",
    u"procedure", u"public", u"raiserror", u"read", u"readtext", u"reconfigure", u"references",
    u"replication", u"restore", u"restrict", u"return", u"revert", u"revoke", u"right", u"rollback",
    u"rowcount", u"rowguidcol", u"rule", u"save", u"schema", u"securityaudit", u"select",
    u"semantickeyphrasetable", u"semanticsimilaritydetailstable", u"semanticsimilaritytable",
    u"session_user", u"set", u"setuser", u"shutdown", u"some", u"statistics", u"system_user",
    u"table", u"tablesample", u"textsize", u"then", u"to", u"top", u"tran", u"transaction",
    u"trigger", u"truncate", u"try_convert", u"tsequal", u"union", u"unique", u"unpivot", u"update",
    u"updatetext", u"use", u"user", u"values", u"varying", u"view", u"waitfor", u"when", u"where",
    u"while", u"with", u"within", u"writetext",
};

// Of the norm of 2016 with its parts about other data, as its list has them.
constexpr StringView standard[] = {
    u"abs", u"absent", u"acos", u"all", u"allocate", u"alter", u"and", u"any", u"are", u"array",
    u"array_agg", u"array_max_cardinality", u"as", u"asensitive", u"asin", u"asymmetric", u"at",
    u"atan", u"atomic", u"authorization", u"avg", u"begin", u"begin_frame", u"begin_partition",
    u"between", u"bigint", u"binary", u"blob", u"boolean", u"both", u"by", u"call", u"called",
    u"cardinality", u"cascaded", u"case", u"cast", u"ceil", u"ceiling", u"char", u"char_length",
    u"character", u"character_length", u"check", u"classifier", u"clob", u"close", u"coalesce",
    u"collate", u"collect", u"column", u"commit", u"condition", u"connect", u"constraint",
    u"contains", u"convert", u"copy", u"corr", u"corresponding", u"cos", u"cosh", u"count",
    u"covar_pop", u"covar_samp", u"create", u"cross", u"cube", u"cume_dist", u"current",
    u"current_catalog", u"current_date", u"current_default_transform_group", u"current_path",
    u"current_role", u"current_row", u"current_schema", u"current_time", u"current_timestamp",
    u"current_transform_group_for_type", u"current_user", u"cursor", u"cycle", u"datalink", u"date",
    u"day", u"deallocate", u"dec", u"decfloat", u"decimal", u"declare", u"default", u"define",
    u"delete", u"dense_rank", u"deref", u"describe", u"deterministic", u"disconnect", u"distinct",
    u"dlnewcopy", u"dlpreviouscopy", u"dlurlcomplete", u"dlurlcompleteonly", u"dlurlcompletewrite",
    u"dlurlpath", u"dlurlpathonly", u"dlurlpathwrite", u"dlurlscheme", u"dlurlserver", u"dlvalue",
    u"double", u"drop", u"dynamic", u"each", u"element", u"else", u"empty", u"end", u"end_frame",
    u"end_partition", u"equals", u"escape", u"every", u"except", u"exec", u"execute", u"exists",
    u"exp", u"external", u"extract", u"false", u"fetch", u"filter", u"first_value", u"float",
    u"floor", u"for", u"foreign", u"frame_row", u"free", u"from", u"full", u"function", u"fusion",
    u"get", u"global", u"grant", u"group", u"grouping", u"groups", u"having", u"hold", u"hour",
    u"identity", u"import", u"in", u"indicator", u"initial", u"inner", u"inout", u"insensitive",
    u"insert", u"int", u"integer", u"intersect", u"intersection", u"interval", u"into", u"is",
    u"join", u"json_array", u"json_arrayagg", u"json_exists", u"json_object", u"json_objectagg",
    u"json_query", u"json_table", u"json_table_primitive", u"json_value", u"lag", u"language",
    u"large", u"last_value", u"lateral", u"lead", u"leading", u"left", u"like", u"like_regex",
    u"listagg", u"ln", u"local", u"localtime", u"localtimestamp", u"log", u"log10", u"lower",
    u"match", u"match_number", u"match_recognize", u"matches", u"max", u"measures", u"member",
    u"merge", u"method", u"min", u"minute", u"mod", u"modifies", u"module", u"month", u"multiset",
    u"national", u"natural", u"nchar", u"nclob", u"new", u"no", u"none", u"normalize", u"not",
    u"nth_value", u"ntile", u"null", u"nullif", u"numeric", u"occurrences_regex", u"octet_length",
    u"of", u"offset", u"old", u"omit", u"on", u"one", u"only", u"open", u"or", u"order", u"out",
    u"outer", u"over", u"overlaps", u"overlay", u"parameter", u"partition", u"pattern", u"per",
    u"percent", u"percent_rank", u"percentile_cont", u"percentile_disc", u"period", u"permute",
    u"portion", u"position", u"position_regex", u"power", u"precedes", u"precision", u"prepare",
    u"primary", u"procedure", u"ptf", u"range", u"rank", u"reads", u"real", u"recursive", u"ref",
    u"references", u"referencing", u"regr_avgx", u"regr_avgy", u"regr_count", u"regr_intercept",
    u"regr_r2", u"regr_slope", u"regr_sxx", u"regr_sxy", u"regr_syy", u"release", u"result",
    u"return", u"returns", u"revoke", u"right", u"rollback", u"rollup", u"row", u"row_number",
    u"rows", u"running", u"savepoint", u"scope", u"scroll", u"search", u"second", u"seek",
    u"select", u"sensitive", u"session_user", u"set", u"show", u"similar", u"sin", u"sinh", u"skip",
    u"smallint", u"some", u"specific", u"specifictype", u"sql", u"sqlexception", u"sqlstate",
    u"sqlwarning", u"sqrt", u"start", u"static", u"stddev_pop", u"stddev_samp", u"submultiset",
    u"subset", u"substring", u"substring_regex", u"succeeds", u"sum", u"symmetric", u"system",
    u"system_time", u"system_user", u"table", u"tablesample", u"tan", u"tanh", u"then", u"time",
    u"timestamp", u"timezone_hour", u"timezone_minute", u"to", u"trailing", u"translate",
    u"translate_regex", u"translation", u"treat", u"trigger", u"trim", u"trim_array", u"true",
    u"truncate", u"uescape", u"union", u"unique", u"unknown", u"unmatched", u"unnest", u"update",
    u"upper", u"user", u"using", u"value", u"value_of", u"values", u"var_pop", u"var_samp",
    u"varbinary", u"varchar", u"varying", u"versioning", u"when", u"whenever", u"where",
    u"width_bucket", u"window", u"with", u"within", u"without", u"xml", u"xmlagg", u"xmlattributes",
    u"xmlbinary", u"xmlcast", u"xmlcomment", u"xmlconcat", u"xmldocument", u"xmlelement",
    u"xmlexists", u"xmlforest", u"xmliterate", u"xmlnamespaces", u"xmlparse", u"xmlpi", u"xmlquery",
    u"xmlserialize", u"xmltable", u"xmltext", u"xmlvalidate", u"year",
};
// clang-format on

static_assert(std::is_sorted(std::begin(sqlite), std::end(sqlite)));
static_assert(std::is_sorted(std::begin(postgres), std::end(postgres)));
static_assert(std::is_sorted(std::begin(mysql), std::end(mysql)));
static_assert(std::is_sorted(std::begin(sqlServer), std::end(sqlServer)));
static_assert(std::is_sorted(std::begin(standard), std::end(standard)));

} // namespace

std::span<const StringView> reservedWords(Dialect dialect) {
    switch (dialect) {
    case Dialect::SQLite: return sqlite;
    case Dialect::PostgreSQL: return postgres;
    case Dialect::MySQL: return mysql;
    case Dialect::SqlServer: return sqlServer;
    case Dialect::Standard: break;
    }
    return standard;
}

bool isReserved(StringView word, Dialect dialect) {
    String lower(word);
    for (char16_t& c : lower)
        if (c >= u'A' && c <= u'Z') c = static_cast<char16_t>(c + (u'a' - u'A'));
    const auto words = reservedWords(dialect);
    return std::binary_search(words.begin(), words.end(), StringView(lower));
}

} // namespace zandor::model::sql

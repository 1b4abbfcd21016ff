#pragma once

#include <Zandor/Query.h>
#include <Zandor/files/Error.h>
#include <Zandor/files/export.h>
#include <Zandor/sql/Dialect.h>

#include <memory>
#include <optional>
#include <string>
#include <string_view>

/// Queries as files. The format is described in docs/file-format.md.
namespace zandor::files {

/// What a file has beyond what this version knows.
struct Unknown;

/// A statement that somebody has typed for a query, and that the query does not say (yet).
struct TypedStatement {
    platform::String text = {};                                ///< as it was typed
    model::sql::Dialect dialect = model::sql::Dialect::SQLite; ///< that it is typed in

    bool operator==(const TypedStatement&) const = default;
};

/// A query as a file holds it. A document made from a query alone has nothing beyond it. What the
/// file said beyond this version's knowledge belongs to the object it stood at, by that object's
/// key, and is written again as long as the object is there.
struct ZANDOR_FILES_EXPORT QueryDocument {
    QueryDocument() = default;
    /// Of a query alone, which is shared, not copied.
    QueryDocument(platform::Ref<model::Query> query) : query(std::move(query)) {}

    /// Never nothing.
    platform::Ref<model::Query> query = platform::makeRef<model::Query>();
    /// Address of the database that the query asks, for the program that opens the file; empty:
    /// none is known. Written as it stands, so it must not have a password in it.
    platform::String database = {};
    /// Nothing: the query itself is all that there is.
    std::optional<TypedStatement> typed = {};
    /// What the file has beyond this version's knowledge; nothing: no more.
    std::shared_ptr<const Unknown> unknown = {};
};

/// The version that is written; older ones are read.
inline constexpr int currentVersion = 3;

/// The document as JSON. Refused when a text in the query has half a character (an unpaired
/// surrogate) or the query goes beyond the limits of a file: what is written can be read again,
/// and is the same then.
ZANDOR_FILES_EXPORT Result<std::string> toJson(const QueryDocument& document);

/// The document that a text holds: UTF-8, of this version or an older one. Refuses everything else
/// and says in which line or under which JSON pointer the fault is.
ZANDOR_FILES_EXPORT Result<QueryDocument> fromJson(std::string_view text);

/// The document with the files of its saved queries named as a file has them: from its own folder.
ZANDOR_FILES_EXPORT QueryDocument namedFrom(QueryDocument document, const Path& file);

/// Writes the file as a Replacement, namedFrom it: on a failure the old file is as it was and no
/// other is left. Nothing on success.
ZANDOR_FILES_EXPORT std::optional<Error> saveQuery(const Path& path, const QueryDocument& document);

/// The document of a file, as fromJson; the error also where the file cannot be read. The files of
/// its saved queries are absolute paths then.
ZANDOR_FILES_EXPORT Result<QueryDocument> loadQuery(const Path& path);

} // namespace zandor::files

#pragma once

#include <Zandor/Query.h>
#include <Zandor/files/Error.h>
#include <Zandor/files/export.h>

/// Saved queries that stand in another one as tables, and the files that they came from. Each
/// stands there by value, so that it is still there when its file is not.
namespace zandor::files {

/// A query file as it is to stand in the query of another file, `into`; empty: one that is saved
/// nowhere. The saved queries in it are read anew as well; one whose file is lost is taken as it
/// stands there. Refused are a file that loadQuery refuses, one that reads from `into` or from
/// itself, and what model::Query::refusalOf has something to say to.
ZANDOR_FILES_EXPORT Result<model::SavedQuery> readSavedQuery(const Path& path,
                                                             const Path& into = {});

/// What became of the saved queries of a query.
struct ReadAgain {
    std::vector<platform::String> changed = {}; ///< names of the tables that are others now
    std::vector<Error> kept = {};               ///< why some stay as they are
};

/// Gives the saved queries of a query what their files have by now. One whose file is lost, or no
/// longer gives what is used here, stays as it is. `into` as above.
ZANDOR_FILES_EXPORT ReadAgain readSavedAgain(model::Query& query, const Path& into = {});

} // namespace zandor::files

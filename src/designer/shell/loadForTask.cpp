#include "designer/shell/loadForTask.h"

#include "designer/document/paths.h"
#include "designer/shell/Task.h"
#include "designer/shell/Words.h"
#include "designer/statement/ModelWords.h"

#include <Zandor/files/SavedQueries.h>

namespace zandor::designer::shell {

files::Result<files::QueryDocument> loadForTask(const QString& path) {
    auto document = files::loadQuery(pathOf(path));
    if (!document) return document;
    for (const files::Error& error : files::readSavedAgain(*document->query, pathOf(path)).kept)
        complain(inWords(error));
    if (document->typed)
        complain(Words::tr("The text that was typed beside the drawing is left out."));
    return document;
}

} // namespace zandor::designer::shell

#pragma once

#include "designer/run/Command.h"

#include <Zandor/QueryDocument.h>
#include <Zandor/model/Result.h>

namespace zandor::designer {

/// A statement as somebody has typed it, on its way to an engine without a drawing.
struct TypedRun {
    struct Place {
        qsizetype begin;
        qsizetype end;
        QString parameter;
    };

    QString statement; ///< the one that there is, without its ";"
    model::sql::Dialect dialect;
    std::vector<Place> parameters; ///< in their order
};

/// What of a typed statement is to be run on an engine, or one line on why it is not: there must be
/// one query and no more, in the engine's own dialect, and the engine one that can be kept from
/// writing whatever a statement says.
model::Result<TypedRun, QString> typedRun(const files::TypedStatement& typed,
                                          model::sql::Dialect engine);

/// The parameters in the order in which the statement uses them first.
std::vector<Question> questions(const TypedRun& typed);

/// The statement with the answers written out; there has to be one to every question.
Command makeCommand(const TypedRun& typed, const Answers& answers, std::optional<qint64> limit);

} // namespace zandor::designer

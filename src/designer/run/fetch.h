#pragma once

#include "designer/database/Database.h"
#include "designer/run/Cell.h"
#include "designer/run/Command.h"

#include <QStringList>

#include <atomic>

namespace zandor::designer {

/// Takes the rows of a statement, one after the other. What a member returns is what went wrong,
/// one line for a user; no further row comes then.
class Sink {
public:
    virtual ~Sink() = default;
    /// The names of the columns, before the first row.
    virtual std::optional<QString> begin(const QStringList& columns) = 0;
    virtual std::optional<QString> add(const Row& row) = 0;
    /// After the last row that was asked for; never after an end that came before it.
    virtual std::optional<QString> finish() = 0;
};

/// How a statement came to its end.
struct Outcome {
    enum class End {
        complete,
        limited, ///< there are more rows than the command's limit
        cancelled,
        unreachable, ///< there is no connection
        refused,     ///< the sink could not take a row
        failed,      ///< the engine did not do it
        lost,        ///< the connection broke down
    };

    End end = End::complete;
    QString message = {}; ///< the engine's words, or ours in the designer's language
    qint64 rows = 0;      ///< that the sink took
};

/// Runs a command over a connection of its own, with the rows coming as the sink takes them. As
/// soon as `stop` is true the engine ceases to work on it, wherever it is.
Outcome fetch(const Connector& connector, const Command& command, Sink& sink,
              const std::atomic<bool>& stop);

} // namespace zandor::designer

#pragma once

#include <Zandor/sql/Builder.h>

#include <QMap>
#include <QVariant>

#include <optional>
#include <vector>

namespace zandor::designer {

/// What is sent to the engine.
struct Command {
    QString statement;
    QVariantList values;         ///< for the placeholders, in their order
    std::optional<qint64> limit; ///< so many rows are taken at most
    bool isTyped = false;        ///< by somebody: the engine makes sure that it is one statement
};

/// A parameter of a query under its name, however often the query uses it.
struct Question {
    QString name;
    std::vector<model::sql::Parameter> uses;
};

/// What was typed for the parameters, by their names.
using Answers = QMap<QString, QString>;

/// The query's statement for the engine. The engine itself is told to give one row more than
/// `limit`, so that it can be quick and one sees that there are more.
model::sql::Text statementFor(model::Query& query, model::sql::Dialect dialect,
                              std::optional<qint64> limit);

/// Whether rows depend on a text, in a criterion or asked for; in patterns it counts too.
bool comparesTexts(const model::sql::Text& text);

/// The parameters in the order in which the statement uses them first.
std::vector<Question> questions(const model::sql::Text& text);

/// What is asked for: "a number", "a date such as 2024-12-31".
QString wanted(const Question& question);

/// Whether what was typed can take the parameter's place everywhere.
bool fits(const Question& question, const QString& typed);

/// `text` has to be runnable, and every question of it to have an answer that fits.
Command makeCommand(const model::sql::Text& text, model::sql::Dialect dialect,
                    const Answers& answers, std::optional<qint64> limit);

} // namespace zandor::designer

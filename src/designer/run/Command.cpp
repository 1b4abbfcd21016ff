#include "designer/run/Command.h"

#include "model/criteria/Literals.h"

#include <Zandor/reader/bindValue.h>

#include <QCoreApplication>

#include <algorithm>

namespace zandor::designer {

using model::ColumnType;
using model::sql::Dialect;
using model::sql::Parameter;
using model::sql::Value;

namespace {

/// Nothing when the text is no value of the parameter's type.
std::optional<QVariant> answerValue(const Parameter& parameter, const QString& typed,
                                    Dialect dialect) {
    const platform::String text = typed.toStdU16String();
    if (parameter.pattern) {
        const platform::String pattern = model::criteria::likePattern(text);
        return reader::bindValue({ColumnType::Text, model::sql::likePattern(pattern, dialect)},
                                 dialect);
    }
    // There a text becomes whatever the column has, and a number need not.
    if (parameter.type == ColumnType::Unknown && dialect == Dialect::PostgreSQL)
        return QVariant(typed.trimmed());
    const bool anyText = parameter.type == ColumnType::Text;
    const std::optional<Value> value =
        model::criteria::literal(anyText ? text : typed.trimmed().toStdU16String(), parameter.type);
    // What is not in hexadecimal digits is a text in those bytes.
    if (!value && parameter.type == ColumnType::Blob) return QVariant(typed.toUtf8());
    if (!value) return {};
    return reader::bindValue(*value, dialect);
}

class QuestionWords {
    Q_DECLARE_TR_FUNCTIONS(zandor::designer::Question)
};

QString wanted(const Parameter& use) {
    if (use.pattern) return QuestionWords::tr("a pattern: * for any characters, ? for one");
    switch (use.type) {
    case ColumnType::Text:
    case ColumnType::Blob: return QuestionWords::tr("a text");
    case ColumnType::Integer:
    case ColumnType::Decimal: return QuestionWords::tr("a number");
    case ColumnType::Date: return QuestionWords::tr("a date such as 2024-12-31");
    case ColumnType::Time: return QuestionWords::tr("a time such as 23:59");
    case ColumnType::Timestamp:
        return QuestionWords::tr("a date and time such as 2024-12-31 23:59");
    case ColumnType::Boolean: return QuestionWords::tr("true or false");
    case ColumnType::Unknown: break;
    }
    return QuestionWords::tr("a value");
}

} // namespace

model::sql::Text statementFor(model::Query& query, Dialect dialect, std::optional<qint64> limit) {
    // Which words for it an engine has that is only known as one behind ODBC cannot be told.
    std::optional<std::int64_t> said;
    if (limit && dialect != Dialect::Standard) said = *limit + 1;
    return statementText(query, dialect, model::sql::ValueForm::bound, said);
}

bool comparesTexts(const model::sql::Text& text) {
    return std::any_of(text.bindings.begin(), text.bindings.end(), [](const auto& binding) {
        if (const auto* parameter = std::get_if<Parameter>(&binding))
            return parameter->type == ColumnType::Text && !parameter->pattern;
        return std::get<Value>(binding).type == ColumnType::Text;
    });
}

std::vector<Question> questions(const model::sql::Text& text) {
    std::vector<Question> result;
    for (const auto& binding : text.bindings) {
        const auto* parameter = std::get_if<Parameter>(&binding);
        if (!parameter) continue;
        const QString name = QString::fromStdU16String(parameter->name);
        const auto known = std::find_if(result.begin(), result.end(),
                                        [&](const Question& each) { return each.name == name; });
        if (known != result.end())
            known->uses.push_back(*parameter);
        else
            result.push_back({name, {*parameter}});
    }
    return result;
}

// The use that asks for most decides.
QString wanted(const Question& question) {
    for (const Parameter& use : question.uses)
        if (!use.pattern && use.type != ColumnType::Unknown && use.type != ColumnType::Text)
            return wanted(use);
    return wanted(question.uses.front());
}

bool fits(const Question& question, const QString& typed) {
    return std::all_of(question.uses.begin(), question.uses.end(), [&](const Parameter& use) {
        return answerValue(use, typed, Dialect::Standard).has_value();
    });
}

Command makeCommand(const model::sql::Text& text, Dialect dialect, const Answers& answers,
                    std::optional<qint64> limit) {
    Command command{QString::fromStdU16String(text.text), {}, limit};
    for (const auto& binding : text.bindings) {
        if (const auto* parameter = std::get_if<Parameter>(&binding)) {
            const QString typed = answers.value(QString::fromStdU16String(parameter->name));
            command.values << answerValue(*parameter, typed, dialect).value();
        } else {
            command.values << reader::bindValue(std::get<Value>(binding), dialect);
        }
    }
    return command;
}

} // namespace zandor::designer

#include "designer/properties/fields.h"

#include <Zandor/model/Functions.h>
#include <Zandor/qt/Text.h>
#include <Zandor/sql/Builder.h>

#include <QRegularExpression>

#include <algorithm>
#include <iterator>
#include <vector>

namespace zandor::designer {

using model::criteria::writtenName;
using platform::qt::fromQt;
using platform::qt::toQt;

namespace {

using TalvikZandorLib::ZDColumn;
using TalvikZandorLib::ZDTable;

/// Calls with each table of a query and each of its columns.
void eachColumn(model::Query& query, const auto& what) {
    for (const auto& table : platform::Each<ZDTable>(query.Tables()))
        for (const auto& column : platform::Each<ZDColumn>(table->Columns())) what(table, column);
}

/// "table.column", or "column" where just one table has it.
platform::Ref<ZDColumn> columnNamed(model::Query& query, const QString& text) {
    platform::Ref<ZDColumn> found;
    std::vector<platform::Ref<ZDColumn>> alone;
    eachColumn(query, [&](const auto& table, const auto& column) {
        const QString own = toQt(column->Name());
        const QString name = toQt(table->Name()) + u'.' + own;
        if (!found && name.compare(text, Qt::CaseInsensitive) == 0) found = column;
        if (own != u"*" && own.compare(text, Qt::CaseInsensitive) == 0) alone.push_back(column);
    });
    return !found && alone.size() == 1 ? alone.front() : found;
}

} // namespace

QString fieldOf(const model::ColumnDefinition& definition) {
    if (definition.isExpression()) return toQt(definition.expression().text);
    const auto column = definition.place().column();
    return column ? toQt(model::Column::field(column)->Name()) : QString();
}

void setField(model::Query& query, model::ColumnDefinition& definition, const QString& text) {
    if (const auto column = columnNamed(query, text))
        definition.Column(column);
    else
        definition.expression(fromQt(text));
}

model::Findings findingsOf(const model::Query& query, const platform::String& key,
                           const QString& text) {
    const auto copy = model::Query::restored(query.record());
    platform::Ref<model::ColumnDefinition> definition;
    for (const auto& each :
         platform::Each<TalvikZandorLib::ZDColumnDefinition>(copy->ColumnDefinitions()))
        if (each->Key() == key)
            definition = std::dynamic_pointer_cast<model::ColumnDefinition>(each);
    if (definition) {
        setField(*copy, *definition, text);
    } else {
        definition = platform::makeRef<model::ColumnDefinition>();
        setField(*copy, *definition, text);
        copy->AddColumnDefinition(definition);
    }
    const auto said = model::sql::statementText(*copy, model::sql::Dialect::SQLite,
                                                model::sql::ValueForm::literal);
    model::Findings result;
    std::copy_if(said.findings.begin(), said.findings.end(), std::back_inserter(result),
                 [&](const model::Finding& finding) {
                     return finding.definition == definition->Key() && finding.row == 0;
                 });
    return result;
}

QStringList completions(model::Query& query) {
    QStringList result;
    eachColumn(query, [&](const auto& table, const auto& column) {
        if (column->Name() != model::Column::allColumns)
            result << toQt(writtenName(table->Name()) + u'.' + writtenName(column->Name()));
    });
    for (const auto& function : model::criteria::functions())
        result << toQt(platform::String(function.name)) + u'(';
    result.sort(Qt::CaseInsensitive);
    return result;
}

QStringList matching(const QStringList& names, const QString& typed) {
    static const QRegularExpression brackets(QStringLiteral("[\\[\\]]"));
    const QString wanted = QString(typed).remove(brackets);
    QStringList begin;
    QStringList contain;
    for (const QString& name : names) {
        const QString bare = QString(name).remove(brackets);
        const QString column = bare.section(u'.', -1);
        if (bare.startsWith(wanted, Qt::CaseInsensitive) ||
            column.startsWith(wanted, Qt::CaseInsensitive))
            begin << name;
        else if (bare.contains(wanted, Qt::CaseInsensitive))
            contain << name;
    }
    return begin + contain;
}

model::ColumnType typeOf(const model::ColumnDefinition& definition) {
    const auto column = definition.isExpression() ? nullptr : definition.place().column();
    return column ? column->description().type : model::ColumnType::Unknown;
}

model::ColumnType outputTypeOf(const model::ColumnDefinition& definition) {
    return model::typeOf(definition.total(), typeOf(definition));
}

} // namespace zandor::designer

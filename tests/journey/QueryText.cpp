#include "QueryText.h"

#include <Zandor/qt/Text.h>

using namespace zandor;

using platform::qt::toQt;

namespace {

const char* const operators[] = {"=", "<>", "<", ">", "<=", ">="};

QString columnName(model::Query& query, const TalvikZandorLib::ZDColumn* column) {
    for (std::int32_t i = 1; i <= query.Tables().Count(); ++i) {
        const auto table = query.Tables().Item(i);
        for (std::int32_t n = 1; n <= table->Columns().Count(); ++n)
            if (column && table->Columns().Item(n)->Key() == column->Key())
                return toQt(table->Name() + u"." + table->Columns().Item(n)->Name());
    }
    return QStringLiteral("(none)");
}

} // namespace

QString textOf(model::Query& query) {
    QString text;
    for (std::int32_t i = 1; i <= query.Tables().Count(); ++i)
        text += "table " + toQt(query.Tables().Item(i)->Name()) + "\n";
    for (std::int32_t i = 1; i <= query.Joins().Count(); ++i) {
        const auto join = query.Joins().Item(i);
        text += QStringLiteral("join %1 %2 %3, type %4\n")
                    .arg(columnName(query, join->LeftColumn().get()),
                         QLatin1String(operators[join->CompareOperator()]),
                         columnName(query, join->RightColumn().get()))
                    .arg(join->JoinType());
    }
    for (std::int32_t i = 1; i <= query.ColumnDefinitions().Count(); ++i) {
        const auto definition = query.ColumnDefinitions().Item(i);
        text += QStringLiteral("column %1 '%2' sort %3 %4")
                    .arg(columnName(query, definition->Column().get()), toQt(definition->Synonym()))
                    .arg(definition->SortOrder())
                    .arg(QLatin1String(definition->Visible() ? "visible" : "hidden"));
        if (const auto* own = dynamic_cast<const model::ColumnDefinition*>(definition.get())) {
            if (own->total() != model::Total::None)
                text += " total " + toQt(platform::String(model::wordOf(own->total())));
            if (own->isExpression()) text += " expression " + toQt(own->expression().text);
        }
        for (std::int32_t n = 1; n <= definition->Criteria().Count(); ++n)
            text += " [" + toQt(definition->Criteria().Item(n)->Criterium()) + "]";
        text += "\n";
    }
    return text;
}

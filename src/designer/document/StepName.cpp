#include "designer/document/StepName.h"

#include <Zandor/model/Names.h>

#include <QCoreApplication>

#include <algorithm>

namespace zandor::designer {

namespace {

using model::Change;
using model::DefinitionState;
using model::JoinState;
using model::TableState;

template <class State>
using Pairs = std::vector<typename model::ListChange<State>::Pair>;

/// A name from the database, short enough for a menu.
QString shown(const platform::String& name) {
    constexpr int longest = 40;
    const QString line = QString::fromStdU16String(model::oneLine(name)).simplified();
    return line.size() <= longest ? line : line.left(longest - 1) + QChar(0x2026);
}

QString nameOf(const TableState& state) { return shown(state.name); }

QString nameOf(const JoinState& state) {
    const auto end = [](const model::ColumnPlace& place) {
        const auto table = place.table().table();
        return table ? shown(table->Name()) : QStringLiteral("?");
    };
    return end(state.left) + QStringLiteral(" - ") + end(state.right);
}

QString nameOf(const DefinitionState& state) {
    if (const auto column = state.column.column()) return shown(column->Name());
    return shown(state.synonym.empty() ? state.expression.text : state.synonym);
}

/// The same but for where names in texts lead: this shows once a table is renamed or deleted.
bool alike(DefinitionState before, DefinitionState after) {
    for (auto* state : {&before, &after}) {
        for (auto& criterion : state->criteria) criterion.text.references.clear();
        state->expression.references.clear();
    }
    return before == after;
}

/// Whether what has gone from one position has come back to another as it was.
template <class Placed>
bool sameObjects(const std::vector<Placed>& gone, const std::vector<Placed>& come) {
    return std::is_permutation(
        gone.begin(), gone.end(), come.begin(), come.end(),
        [](const Placed& before, const Placed& after) { return alike(before.state, after.state); });
}

class StepName {
    Q_DECLARE_TR_FUNCTIONS(zandor::designer::StepName)

public:
    static QString of(const Change& change);

private:
    static QString tables(const Change& change);
    static QString tables(const Pairs<TableState>& changed);
    static QString joins(const model::ListChange<JoinState>& change);
    static QString definitions(const model::ListChange<DefinitionState>& change,
                               const Pairs<DefinitionState>& changed);
    static QString definition(const DefinitionState& before, const DefinitionState& after);
    static QString options(const model::QueryOptions& before, const model::QueryOptions& after);
};

QString StepName::of(const Change& change) {
    Pairs<DefinitionState> definitionsChanged;
    for (const auto& pair : change.definitions.changed)
        if (!alike(pair.before, pair.after)) definitionsChanged.push_back(pair);

    // What hangs on a table goes and is written anew with it.
    QString ofTables = tables(change);
    if (!ofTables.isEmpty()) return ofTables;
    const QString ofJoins = joins(change.joins);
    const QString ofDefinitions = definitions(change.definitions, definitionsChanged);
    const QString ofPlaces = tables(change.tables.changed);
    const QString ofOptions = options(change.optionsBefore, change.optionsAfter);
    const auto none =
        ofJoins.isEmpty() + ofDefinitions.isEmpty() + ofPlaces.isEmpty() + ofOptions.isEmpty();
    if (none < 3) return tr("Change the query");
    return ofJoins + ofDefinitions + ofPlaces + ofOptions;
}

QString StepName::tables(const Change& change) {
    const auto& come = change.tables.come;
    const auto& gone = change.tables.gone;
    if (!come.empty() && !gone.empty()) return tr("Change the query");
    if (gone.size() == 1) return tr("Delete table %1").arg(nameOf(gone.front().state));
    if (!gone.empty()) return tr("Delete %n table(s)", nullptr, static_cast<int>(gone.size()));
    if (come.size() == 1) return tr("Add table %1").arg(nameOf(come.front().state));
    if (!come.empty()) return tr("Add %n table(s)", nullptr, static_cast<int>(come.size()));
    for (const auto& [before, after] : change.tables.changed)
        if (before.name != after.name)
            return tr("Rename table %1 to %2").arg(nameOf(before), nameOf(after));
    return {};
}

QString StepName::tables(const Pairs<TableState>& changed) {
    if (changed.empty()) return {};
    const bool resized = std::any_of(changed.begin(), changed.end(), [](const auto& pair) {
        return pair.before.width != pair.after.width || pair.before.height != pair.after.height;
    });
    const int count = static_cast<int>(changed.size());
    const QString name = nameOf(changed.front().after);
    if (count > 1)
        return resized ? tr("Resize %n table(s)", nullptr, count)
                       : tr("Move %n table(s)", nullptr, count);
    return (resized ? tr("Resize table %1") : tr("Move table %1")).arg(name);
}

QString StepName::joins(const model::ListChange<JoinState>& change) {
    const auto& [gone, come, changed] = change;
    if (change.empty()) return {};
    if (gone.empty() && changed.empty())
        return come.size() == 1 ? tr("Add join %1").arg(nameOf(come.front().state))
                                : tr("Add %n join(s)", nullptr, static_cast<int>(come.size()));
    if (come.empty() && changed.empty())
        return gone.size() == 1 ? tr("Delete join %1").arg(nameOf(gone.front().state))
                                : tr("Delete %n join(s)", nullptr, static_cast<int>(gone.size()));
    if (gone.empty() && come.empty() && changed.size() == 1)
        return tr("Change join %1").arg(nameOf(changed.front().after));
    return tr("Change joins");
}

QString StepName::definitions(const model::ListChange<DefinitionState>& change,
                              const Pairs<DefinitionState>& changed) {
    const auto& gone = change.gone;
    const auto& come = change.come;
    if (gone.empty() && come.empty()) {
        if (changed.empty()) return {};
        if (changed.size() == 1) return definition(changed.front().before, changed.front().after);
        return tr("Change %n column(s)", nullptr, static_cast<int>(changed.size()));
    }
    if (changed.empty() && sameObjects(gone, come))
        return come.size() == 1 ? tr("Move column %1").arg(nameOf(come.front().state))
                                : tr("Move %n column(s)", nullptr, static_cast<int>(come.size()));
    if (gone.empty() && changed.empty())
        return come.size() == 1 ? tr("Add column %1").arg(nameOf(come.front().state))
                                : tr("Add %n column(s)", nullptr, static_cast<int>(come.size()));
    if (come.empty() && changed.empty())
        return gone.size() == 1 ? tr("Delete column %1").arg(nameOf(gone.front().state))
                                : tr("Delete %n column(s)", nullptr, static_cast<int>(gone.size()));
    return tr("Change columns");
}

QString StepName::definition(const DefinitionState& before, const DefinitionState& after) {
    const auto but = [&](auto... member) {
        DefinitionState same = after;
        ((same.*member = before.*member), ...);
        return alike(before, same);
    };
    const QString name = nameOf(after);
    if (but(&DefinitionState::criteria)) return tr("Change criterion of %1").arg(name);
    if (but(&DefinitionState::synonym)) return tr("Rename column %1").arg(name);
    if (but(&DefinitionState::total)) return tr("Change total of %1").arg(name);
    if (but(&DefinitionState::expression, &DefinitionState::column))
        return tr("Change field of %1").arg(name);
    if (but(&DefinitionState::sortOrder) || but(&DefinitionState::sortPriority))
        return tr("Change sorting by %1").arg(name);
    if (but(&DefinitionState::format, &DefinitionState::decimals))
        return tr("Change format of %1").arg(name);
    if (but(&DefinitionState::visible))
        return (after.visible ? tr("Show column %1") : tr("Hide column %1")).arg(name);
    if (but(&DefinitionState::width)) return tr("Resize column %1").arg(name);
    return tr("Change column %1").arg(name);
}

QString StepName::options(const model::QueryOptions& before, const model::QueryOptions& after) {
    if (before == after) return {};
    model::QueryOptions same = after;
    same.description = before.description;
    return same == before ? tr("Describe the query") : tr("Change which rows come out");
}

} // namespace

QString stepName(const model::Change& change) { return StepName::of(change); }

} // namespace zandor::designer

#include "model/files/SavedFiles.h"

#include "model/files/Refusal.h"

#include <Zandor/files/SavedQueries.h>

#include <algorithm>
#include <map>

namespace zandor::files {

namespace {

using model::QueryRecord;
using model::SavedQuery;
using platform::String;

Path pathOf(const String& file) { return platform::toUtf8(file); }
String textOf(const Path& path) { return platform::fromUtf8(path.generic_string()); }

Path resolved(const Path& path) {
    std::error_code unheeded;
    const Path found = std::filesystem::weakly_canonical(path, unheeded);
    return unheeded ? std::filesystem::absolute(path, unheeded) : found;
}

template <class Rename>
void rename(QueryRecord& record, Rename rename) {
    for (auto& table : record.tables) {
        if (!table.query) continue;
        SavedQuery saved = *table.query;
        if (!saved.file.empty()) saved.file = textOf(rename(pathOf(saved.file)));
        files::rename(saved.record, rename);
        table.query = std::move(saved);
    }
}

template <class Rename>
QueryDocument renamed(QueryDocument document, Rename rename) {
    QueryRecord record = document.query->record();
    if (model::depthOf(record) == 0) return document;
    files::rename(record, rename);
    document.query = model::Query::restored(record);
    return document;
}

/// Without what only its own drawing shows.
QueryRecord undrawn(QueryRecord record) {
    for (auto& table : record.tables) {
        const model::TableRecord unplaced;
        table.left = unplaced.left;
        table.top = unplaced.top;
        table.width = unplaced.width;
        table.height = unplaced.height;
        table.selected = unplaced.selected;
        for (auto& column : table.columns) column.selected = false;
    }
    for (auto& definition : record.definitions) definition.width = 0;
    return record;
}

/// Reads saved queries within the file that `chain` ends with; each of it reads from the next.
class Reading {
public:
    explicit Reading(const Path& into) {
        if (!into.empty()) mChain.push_back(resolved(into));
        mOutside = mChain.size();
    }

    Result<SavedQuery> read(const Path& path) {
        const Path file = resolved(path);
        if (std::find(mChain.begin(), mChain.end(), file) != mChain.end()) {
            mCircle = true;
            return Error{model::say<MessageCode::readsFromItself>(nameOf(path))};
        }
        if (const auto known = mRead.find(file); known != mRead.end()) return known->second;
        auto document = loadQuery(path);
        if (!document) return document.failure();
        mChain.push_back(file);
        const ReadAgain inner = again(*document->query);
        mChain.pop_back();
        if (mCircle) return inner.kept.back();
        SavedQuery saved{textOf(file), undrawn(document->query->record())};
        if (const auto refusal = model::Query::refusalOf(saved))
            return Error{model::say<MessageCode::fileNotUsed>(nameOf(path), *refusal)};
        mRead.emplace(file, saved);
        return saved;
    }

    ReadAgain again(model::Query& query) {
        ReadAgain result;
        for (std::int32_t position = 1; position <= query.Tables().Count(); ++position) {
            const auto table =
                std::static_pointer_cast<model::Table>(query.Tables().Item(position));
            if (!table->savedQuery() || table->savedQuery()->file.empty()) continue;
            auto saved = read(pathOf(table->savedQuery()->file));
            if (!saved) {
                result.kept.push_back(saved.failure());
                // All of the file that closes a circle is refused, but not what stands beside it.
                if (mCircle && mChain.size() > mOutside) break;
                mCircle = false;
                continue;
            }
            if (saved->record == table->savedQuery()->record) continue;
            if (auto refusal = query.refusalOf(*table, *saved)) {
                result.kept.emplace_back(std::move(*refusal));
                continue;
            }
            query.refreshQuery(table, std::move(*saved));
            result.changed.push_back(table->Name());
        }
        return result;
    }

private:
    std::vector<Path> mChain;
    std::map<Path, SavedQuery> mRead; ///< one that many read from is read once
    std::size_t mOutside = 0;         ///< so long is the chain where the reading began
    bool mCircle = false;
};

} // namespace

QueryDocument namedFrom(QueryDocument document, const Path& file) {
    const Path folder = resolved(file).parent_path();
    return renamed(std::move(document),
                   [&](const Path& path) { return path.lexically_proximate(folder); });
}

QueryDocument namedAbsolutely(QueryDocument document, const Path& file) {
    const Path folder = resolved(file).parent_path();
    return renamed(std::move(document), [&](const Path& path) { return resolved(folder / path); });
}

Result<SavedQuery> readSavedQuery(const Path& path, const Path& into) {
    return Reading(into).read(path);
}

ReadAgain readSavedAgain(model::Query& query, const Path& into) {
    return Reading(into).again(query);
}

} // namespace zandor::files

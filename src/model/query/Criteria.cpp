#include <Zandor/model/Criteria.h>

#include <optional>

namespace zandor::model {

namespace {

/// The row that a key names. One row has one key: no sign, no blank, no leading zero.
std::optional<std::int16_t> rowOf(const String& key) {
    constexpr std::size_t mostDigits = 5;
    if (key.empty() || key.size() > mostDigits || key.front() == u'0') return {};
    std::int32_t row = 0;
    for (const char16_t c : key) {
        if (c < u'0' || c > u'9') return {};
        row = row * 10 + (c - u'0');
    }
    if (row < Criteria::firstRow || row > INT16_MAX) return {};
    return static_cast<std::int16_t>(row);
}

} // namespace

std::int32_t Criteria::Count() const {
    return mRows.empty() ? 0 : mRows.rbegin()->first - firstRow + 1;
}

Ref<TalvikZandorLib::ZDCriterium> Criteria::Item(std::int32_t position) const {
    if (position < 1 || position > Count()) throw platform::errors::subscriptOutOfRange();
    const auto at = mRows.find(static_cast<std::int16_t>(position - 1 + firstRow));
    if (at == mRows.end()) return platform::makeRef<RowCriterium>(std::make_shared<Revision>());
    return at->second;
}

Ref<TalvikZandorLib::ZDCriterium> Criteria::Item(const String& key) const {
    if (!Contains(key)) throw platform::errors::invalidProcedureCall();
    return mRows.at(*rowOf(key));
}

void Criteria::Remove(const String& key) {
    if (!Contains(key)) throw platform::errors::invalidProcedureCall();
    mRows.erase(*rowOf(key));
    mRevision->raise();
}

bool Criteria::Contains(const String& key) const {
    const auto row = rowOf(key);
    return row && mRows.contains(*row);
}

void Criteria::Add(const String& text, const String& key) {
    const auto row = rowOf(key);
    if (!row) throw platform::errors::invalidProcedureCall();
    if (!mRows.emplace(*row, platform::makeRef<RowCriterium>(mRevision, text)).second)
        throw platform::errors::duplicateKey();
    mRevision->raise();
}

void Criteria::clear() {
    mRows.clear();
    mRevision->raise();
}

} // namespace zandor::model

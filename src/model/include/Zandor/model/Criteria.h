#pragma once

#include <Zandor/model/References.h>
#include <Zandor/model/export.h>

#include <map>

namespace zandor::model {

using platform::Ref;
using platform::String;

/// The criterion of one row.
class ZANDOR_MODEL_EXPORT RowCriterium final : public TalvikZandorLib::ZDCriterium {
public:
    /// `revision` is that of the definition, raised also after the criterium was removed from it.
    explicit RowCriterium(std::shared_ptr<Revision> revision, String text = {})
        : mRevision(std::move(revision)), mTied(*mRevision, {std::move(text), {}}) {}
    String Criterium() const override { return mTied->text; }
    /// The names in a new text mean what they name when the query is next read or changed.
    void Criterium(const String& value) override { tie({value, {}}); }

    /// The text and what names in it are tied to already.
    const criteria::TiedText& tied() const { return *mTied; }
    /// The text with the places of its names.
    void tie(criteria::TiedText text) { mTied = std::move(text); }

private:
    const std::shared_ptr<Revision> mRevision;
    Revised<criteria::TiedText> mTied;
};

/// The criteria of one definition by grid row, 4 to 32767. Keys are rows in decimal: "4", "5".
///
/// Rows mean something across definitions (criteria of one row hold together), so a criterium keeps
/// its row: by position, a row without one reads as an empty criterium that belongs to nobody.
class ZANDOR_MODEL_EXPORT Criteria final
    : public TalvikZandorLib::EditableCollection<TalvikZandorLib::ZDCriterium> {
public:
    static constexpr std::int16_t firstRow = 4; ///< of the grid, from 0

    /// `revision` is that of the definition. Definitions of other models have none and leave it.
    explicit Criteria(std::shared_ptr<Revision> revision = std::make_shared<Revision>())
        : mRevision(std::move(revision)) {}

    /// Rows from the first to the last one that has a criterium.
    std::int32_t Count() const override;
    Ref<TalvikZandorLib::ZDCriterium> Item(std::int32_t position) const override;
    Ref<TalvikZandorLib::ZDCriterium> Item(const String& key) const override;
    void Remove(const String& key) override;

    /// Whether the row of a key has a criterium; false for a key that is no row.
    bool Contains(const String& key) const;
    /// Error 457 when the row has a criterium, error 5 when the key is no row; nothing is added
    /// then.
    void Add(const String& text, const String& key);
    void clear(); ///< leaves no criterium

    /// The criteria that there are, in the order of their rows.
    const std::map<std::int16_t, Ref<RowCriterium>>& rows() const { return mRows; }

private:
    const std::shared_ptr<Revision> mRevision;
    std::map<std::int16_t, Ref<RowCriterium>> mRows;
};

} // namespace zandor::model

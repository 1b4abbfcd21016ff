#pragma once

#include <Zandor/TalvikZandorLib.h>
#include <Zandor/platform/export.h>

#include <functional>
#include <vector>

namespace TalvikDBxZandor {

namespace platform = zandor::platform;

/// What the menu opens over. No entry of the control's is made ready for any other number.
namespace menuSource {
inline constexpr std::int16_t table = 0;  ///< over a table's list
inline constexpr std::int16_t canvas = 1; ///< over the canvas beside them
inline constexpr std::int16_t grid = 2;   ///< over the grid
} // namespace menuSource

/// A column of a table on the canvas: one end of a join.
struct JoinEnd {
    platform::Ref<TalvikZandorLib::ZDTable> Table;   ///< never nothing
    platform::Ref<TalvikZandorLib::ZDColumn> Column; ///< one of its columns
};

/// Where the menu is about to open. What is not there is nothing.
struct MenuPlace {
    std::int16_t Source = menuSource::canvas;                      ///< one of menuSource
    platform::Ref<TalvikZandorLib::ZDTable> Table;                 ///< whose list it is
    platform::Ref<TalvikZandorLib::ZDColumn> Column;               ///< its first selected one
    platform::Ref<TalvikZandorLib::ZDJoin> Join;                   ///< whose line was hit
    platform::Ref<TalvikZandorLib::ZDColumnDefinition> Definition; ///< of the grid's column
    std::int32_t Row = -1;                                         ///< of the grid, from 0
    float X = 0;                                                   ///< on the canvas, in twips
    float Y = 0;                                                   ///< the same, downwards
};

/// An entry of the host's in the menu.
struct HostEntry {
    platform::String Caption; ///< "-" makes a separator; an ampersand marks the mnemonic
    std::function<void()> Chosen; ///< runs when the menu has closed; may be empty
    bool Enabled = true;          ///< whether it can be chosen
};

/// What a control asks its host before its user's acts are done, beside the events, which tell what
/// has been done. Each answer that is not given leaves everything as it is.
///
/// What is refused does not happen: the model is not called for it and no event tells of it. The
/// model as the host changes it itself is nobody's question. An exception in an answer is reported
/// as error 440 and refuses; of the menu it costs the host's entries. A host that binds a model, or
/// shows its own anew, before it answers has refused as well, for what it was asked about may not be
/// there any more.
class ZANDOR_CONTROL_EXPORT Questions {
public:
    virtual ~Questions() = default;

    /// May a join be made, from the column that was dragged or copied to the one it came to?
    virtual bool MayJoin(const JoinEnd& left, const JoinEnd& right);
    /// May a join be deleted?
    virtual bool MayRemoveJoin(const platform::Ref<TalvikZandorLib::ZDJoin>& join);
    /// May a table be closed, and what hangs on it with it?
    virtual bool MayCloseTable(const platform::Ref<TalvikZandorLib::ZDTable>& table);
    /// May a column come out: become an output column, or take the place of another one's field?
    virtual bool MayComeOut(const platform::Ref<TalvikZandorLib::ZDColumn>& column);
    /// May an output column be deleted?
    virtual bool
    MayRemoveColumn(const platform::Ref<TalvikZandorLib::ZDColumnDefinition>& definition);

    /// The host's entries, behind the control's own and a separator. One that is chosen runs when
    /// the menu has closed. The control's own are shown and hidden by its properties.
    virtual std::vector<HostEntry> MenuEntries(const MenuPlace& place);
};

} // namespace TalvikDBxZandor

#pragma once

#include "frontends/windows/automation/com/Held.h"

#include <Zandor/TalvikZandorLib.h>

/// Objects of a query model on their way between the control and its host. On this side they are
/// TalvikZandorLib's, on the other objects of automation; each is the same one whichever way and
/// however often it passes.
namespace zandor::automation {

// To the host: its own object where it has handed over one, else one of ours that stands for the
// model's; nothing for nothing. std::bad_alloc where there is no room.
Held<IDispatch> toHost(const platform::Ref<TalvikZandorLib::Zandor>& query);
Held<IDispatch> toHost(const platform::Ref<TalvikZandorLib::ZDTable>& table);
Held<IDispatch> toHost(const platform::Ref<TalvikZandorLib::ZDColumn>& column);
Held<IDispatch> toHost(const platform::Ref<TalvikZandorLib::ZDJoin>& join);
Held<IDispatch> toHost(const platform::Ref<TalvikZandorLib::ZDColumnDefinition>& definition);
Held<IDispatch> toHost(const platform::Ref<TalvikZandorLib::ZDCriterium>& criterium);

/// From the host: what stands behind one of our own objects, else one that asks the host's; nothing
/// for nothing. Error 13 for an object of ours that is another kind of thing.
template <class T>
platform::Ref<T> fromHost(IDispatch* object);

template <>
platform::Ref<TalvikZandorLib::Zandor> fromHost(IDispatch* object);
template <>
platform::Ref<TalvikZandorLib::ZDTable> fromHost(IDispatch* object);
template <>
platform::Ref<TalvikZandorLib::ZDColumn> fromHost(IDispatch* object);
template <>
platform::Ref<TalvikZandorLib::ZDJoin> fromHost(IDispatch* object);
template <>
platform::Ref<TalvikZandorLib::ZDColumnDefinition> fromHost(IDispatch* object);
template <>
platform::Ref<TalvikZandorLib::ZDCriterium> fromHost(IDispatch* object);

} // namespace zandor::automation

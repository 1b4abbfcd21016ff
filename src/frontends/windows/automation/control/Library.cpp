#include "frontends/windows/automation/control/Library.h"

#include "frontends/windows/automation/model/OpenDefinition.h"
#include "frontends/windows/automation/model/OpenJoin.h"

#include <Zandor/Query.h>

namespace zandor::automation {

using namespace TalvikZandorLib;
using platform::makeRef;
using platform::Ref;

Ref<Zandor> Library::NewZandor() { return makeRef<model::Query>(); }

Ref<ZDJoin> Library::NewZDJoin() {
    if (servesReadyMade()) return makeRef<model::Join>();
    return makeRef<OpenJoin>();
}

Ref<ZDColumnDefinition> Library::NewZDColumnDefinition() {
    if (servesReadyMade()) return makeRef<model::ColumnDefinition>();
    return makeRef<OpenDefinition>();
}

bool Library::servesReadyMade() const {
    return dynamic_cast<const model::Query*>(mControl->P_GET_Zandor().get()) != nullptr;
}

} // namespace zandor::automation

#pragma once

#include "model/Query.h"

namespace model {

/// Makes the objects of this model for the control.
class Library final : public TalvikZandorLib::Library {
public:
    Ref<TalvikZandorLib::Zandor> NewZandor() override { return platform::makeRef<Query>(); }
    Ref<TalvikZandorLib::ZDJoin> NewZDJoin() override { return platform::makeRef<Join>(); }
    Ref<TalvikZandorLib::ZDColumnDefinition> NewZDColumnDefinition() override {
        return platform::makeRef<ColumnDefinition>();
    }
};

} // namespace model

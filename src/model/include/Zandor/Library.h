#pragma once

#include <Zandor/Query.h>
#include <Zandor/model/export.h>

namespace zandor::model {

/// Makes the objects of this model for the control.
class ZANDOR_MODEL_EXPORT Library final : public TalvikZandorLib::Library {
public:
    Ref<TalvikZandorLib::Zandor> NewZandor() override { return platform::makeRef<Query>(); }
    Ref<TalvikZandorLib::ZDJoin> NewZDJoin() override { return platform::makeRef<Join>(); }
    Ref<TalvikZandorLib::ZDColumnDefinition> NewZDColumnDefinition() override {
        return platform::makeRef<ColumnDefinition>();
    }
};

} // namespace zandor::model

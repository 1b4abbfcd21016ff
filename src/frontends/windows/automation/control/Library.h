#pragma once

#include <Zandor/Zandor.h>

namespace zandor::automation {

/// Makes what the control needs of its own accord: of the ready-made model while a query of that
/// one is bound, and else what any host can store.
class Library final : public TalvikZandorLib::Library {
public:
    /// Whose bound query decides.
    void serve(TalvikDBxZandor::Zandor& control) { mControl = &control; }

    platform::Ref<TalvikZandorLib::Zandor> NewZandor() override;
    platform::Ref<TalvikZandorLib::ZDJoin> NewZDJoin() override;
    platform::Ref<TalvikZandorLib::ZDColumnDefinition> NewZDColumnDefinition() override;

private:
    bool servesReadyMade() const;

    TalvikDBxZandor::Zandor* mControl = nullptr;
};

} // namespace zandor::automation

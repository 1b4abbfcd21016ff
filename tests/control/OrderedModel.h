#pragma once

#include "GridStage.h"

namespace gridstage {

/// A model that keeps its definitions in the order of the grid.
class OrderedModel final : public fake::Model, public TalvikZandorLib::OrderedDefinitions {
public:
    using Model::Model;

    void StandsBehind(const Ref<TalvikZandorLib::ZDColumnDefinition>& definition,
                      const Ref<TalvikZandorLib::ZDColumnDefinition>& predecessor) override {
        if (refuses) throw refusal();
        zandor::platform::KeyedCollection<TalvikZandorLib::ZDColumnDefinition> ordered;
        const auto add = [&](const auto& each) { ordered.Add(each, each->Key()); };
        if (!predecessor) add(definition);
        for (const auto& each : zandor::platform::Each(definitions.items)) {
            if (each != definition) add(each);
            if (each == predecessor) add(definition);
        }
        definitions.items = ordered;
    }

    bool refuses = false;
};

} // namespace gridstage

#pragma once

#include "support/Stage.h"

#include <string>

/// "JoinCreated" and so on.
std::string eventName(TalvikDBxZandor::Event event);

/// Keeps on a stage what the control raises.
class StageEvents : public TalvikDBxZandor::ZandorEvents {
public:
    explicit StageEvents(Stage& stage) : mStage(stage) {}
    void Raise(TalvikDBxZandor::Event event,
               const TalvikDBxZandor::EventArguments& arguments) override;

private:
    Stage& mStage;
};

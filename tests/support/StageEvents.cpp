#include "support/StageEvents.h"

std::string eventName(TalvikDBxZandor::Event event) {
    using TalvikDBxZandor::Event;
    switch (event) {
    case Event::TableDeleted: return "TableDeleted";
    case Event::TableMoved: return "TableMoved";
    case Event::Activate: return "Activate";
    case Event::ColumnCreated: return "ColumnCreated";
    case Event::ColumnModified: return "ColumnModified";
    case Event::ColumnRemoved: return "ColumnRemoved";
    case Event::Error: return "Error";
    case Event::JoinCreated: return "JoinCreated";
    case Event::JoinModified: return "JoinModified";
    case Event::JoinRemoved: return "JoinRemoved";
    }
    return std::to_string(static_cast<int>(event));
}

void StageEvents::Raise(TalvikDBxZandor::Event event,
                        const TalvikDBxZandor::EventArguments& arguments) {
    mStage.raised.push_back({event, arguments});
    mStage.transcript.push_back("event:" + eventName(event));
    if (mStage.onEvent) mStage.onEvent();
}

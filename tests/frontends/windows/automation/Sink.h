#pragma once

#include "Scripted.h"

#include <string>
#include <vector>

/// Somebody who listens to a control's events: "-126(New Zanodr is nothing!, -1)".
class Sink {
public:
    explicit Sink(IUnknown* control);
    ~Sink() { unadvise(); }
    Sink(const Sink&) = delete;
    Sink& operator=(const Sink&) = delete;

    const std::vector<std::string>& heard() const { return *mHeard; }
    void unadvise();

    /// What it does at the next event, beside hearing it.
    std::function<void()> then;

private:
    zandor::automation::Held<IConnectionPoint> mPoint;
    zandor::automation::Held<Scripted> mObject;
    std::shared_ptr<std::vector<std::string>> mHeard = std::make_shared<std::vector<std::string>>();
    DWORD mCookie = 0;
};

#pragma once

#include "frontends/windows/automation/com/system.h"

#include <functional>
#include <string>
#include <vector>

/// The user of a thread, who closes each message box as it comes.
class Boxes {
public:
    Boxes();
    Boxes(const Boxes&) = delete;
    Boxes& operator=(const Boxes&) = delete;
    ~Boxes();

    /// The titles of those that have come in this thread since it was asked last.
    static std::vector<std::string> taken();
    /// What is done with the next one instead of closing it, as it comes to the front.
    static void meetNext(std::function<void(HWND)> user);

private:
    HHOOK mHook;
};

#pragma once

#include "HostedControl.h"

#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

/// What is played to a control, one step after the other: gestures of its user and calls of its
/// host.
struct Play {
    std::string name;
    HostedControl::Fill fill;
    std::function<void(HostedControl&)> play;

    friend void PrintTo(const Play& play, std::ostream* out) { *out << play.name; }
};

/// Scripts for what hosts get in the way of, and the scenarios of the suite.
std::vector<Play> plays();

/// As part of a test's name.
std::string nameOf(const testing::TestParamInfo<Play>& info);

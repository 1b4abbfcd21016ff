#include "RandomUser.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <deque>
#include <random>

namespace {

#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__) || !defined(NDEBUG)
constexpr int defaultSteps = 10'000; // slow builds: a part of the walk
#else
constexpr int defaultSteps = 60'000;
#endif
constexpr std::uint64_t defaultSeed = 20;
constexpr int stepsAControl = 2000;
constexpr std::size_t stepsRemembered = 12;

std::uint64_t fromEnvironment(const char* name, std::uint64_t otherwise) {
    const char* const given = std::getenv(name);
    return given ? std::strtoull(given, nullptr, 10) : otherwise;
}

// ZANDOR_SEED walks another way, ZANDOR_STEPS further or less far.
TEST(ARandomWalk, LeavesTheControlConsistentAfterEveryAction) {
    const std::uint64_t seed = fromEnvironment("ZANDOR_SEED", defaultSeed);
    const auto steps = static_cast<int>(fromEnvironment("ZANDOR_STEPS", defaultSteps));
    fake::Library library;
    // The same on every standard library, which its distributions are not.
    std::mt19937_64 engine(seed);
    RandomUser user([&engine](std::uint64_t span) { return engine() % span; }, library);
    std::deque<std::string> trail;
    const auto whence = [&](int step) {
        std::string text =
            "ZANDOR_SEED=" + std::to_string(seed) + ", step " + std::to_string(step) + ", after";
        for (const std::string& action : trail) text += " " + action;
        return text;
    };

    user.open();
    for (int step = 1; step <= steps; ++step) {
        user.act();
        trail.push_back(user.last());
        if (trail.size() > stepsRemembered) trail.pop_front();
        const std::string broken = user.broken();
        ASSERT_EQ(broken, "") << whence(step);
        if (step % stepsAControl != 0 && !user.idle()) continue;
        const std::string survivors = user.close();
        ASSERT_EQ(survivors, "") << whence(step);
        trail.clear();
        user.open();
    }
    user.close();
    // A walk that finds most doors closed shows nothing.
    EXPECT_GT(user.done(), steps / 2);
    EXPECT_GT(user.mostColumns(), 50);
}

} // namespace

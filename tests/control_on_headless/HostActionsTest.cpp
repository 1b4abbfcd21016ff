#include "Plays.h"
#include "support/Sample.h"

#include <iostream>

namespace {

/// A play with the host doing something at one of its places, and what is wrong afterwards.
std::string played(const Play& play, int place, HostAction action, std::string& where) {
    HostedControl c(play.fill);
    c.bind(c.model);
    c.watch(place, action);
    play.play(c);
    where = c.where();
    const std::string broken = c.broken();
    if (!c.calledAfterTheEnd().empty())
        return broken + c.calledAfterTheEnd() + " is called after the end";
    return broken;
}

int placesIn(const Play& play) {
    HostedControl c(play.fill);
    c.bind(c.model);
    c.watch();
    play.play(c);
    return c.places();
}

class AHost : public testing::TestWithParam<Play> {};

// ZANDOR_SAMPLE=n tries every nth cell.
TEST_P(AHost, MayDoAnythingAtAnyTime) {
    const Play& play = GetParam();
    const int places = placesIn(play);
    EXPECT_GT(places, 0);
    int cells = 0;
    int tried = 0;
    int failures = 0;
    for (int place = 1; place <= places; ++place) {
        for (const HostAction action : hostActions) {
            if (cells++ % sampleStep() != 0) continue;
            ++tried;
            std::string where;
            const std::string broken = played(play, place, action, where);
            if (broken.empty()) continue;
            ADD_FAILURE() << "the host " << name(action) << " at place " << place << " (" << where
                          << "): " << broken;
            if (++failures == 30) GTEST_FAIL() << "and so on";
        }
    }
    std::cout << "[ MATRIX   ] " << tried << " of " << cells << " cells tried: " << places
              << " places of " << play.name << '\n';
}

INSTANTIATE_TEST_SUITE_P(During, AHost, testing::ValuesIn(plays()), nameOf);

} // namespace

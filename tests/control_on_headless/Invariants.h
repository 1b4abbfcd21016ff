#pragma once

#include "support/FakeModel.h"

#include <Zandor/Zandor.h>
#include <Zandor/headless/Toolkit.h>

#include <memory>
#include <set>
#include <sstream>
#include <string>
#include <vector>

/// What must be true of a control between any two actions of its user, as long as neither host nor
/// toolkit fails.
class Invariants {
public:
    Invariants(TalvikDBxZandor::Zandor& control, zandor::platform::headless::Toolkit& toolkit)
        : mControl(control), mToolkit(toolkit) {}

    /// What is broken, one line each; empty when all is well.
    std::string broken(const fake::Model& model);

    /// The columns that show definitions now are left over from here on: nothing clears the grid
    /// when another model is bound, so that they may outlive their definitions, or bear the number
    /// of another's.
    void abandonColumns();
    /// From here on a slot may stay taken for what could not be made or drawn, and a join may not
    /// know the name of a table: the toolkit has failed, or there was no memory.
    void loseSlots() { mSlotsLost = true; }
    /// Remembers what the control holds now.
    void watch() { watchElements(); }
    /// What the control held has been destroyed.
    std::string survivors() const;

private:
    void checkTables();
    void checkJoins();
    void checkRecords();
    void checkColumns(const fake::Model& model);
    void checkEditors();
    void checkCanvas();
    void checkSurvivors();
    void watchElements();
    template <class Action>
    void eachElement(const Action& action);
    const zandor::platform::headless::Grid& grid() const;

    TalvikDBxZandor::Zandor& mControl;
    zandor::platform::headless::Toolkit& mToolkit;
    std::ostringstream mBroken;
    std::set<std::int32_t> mLeftOver; ///< key numbers of columns that may outlive their definitions
    bool mAbandoned = false;
    bool mSlotsLost = false;

    struct Watched {
        const char* kind;
        std::int32_t index;
        std::weak_ptr<void> element;
        const void* address;
    };
    std::vector<Watched> mWatched; ///< table lists, their entries, lines and marks
};

#pragma once

#include "Invariants.h"
#include "support/Stage.h"

#include <cstdint>
#include <functional>

/// A user, and a host, who do at random what a user and a host can do.
class RandomUser {
public:
    /// Draws one of so many numbers, from 0.
    using Draw = std::function<std::uint64_t(std::uint64_t span)>;
    RandomUser(Draw draw, fake::Library& library) : mDraw(std::move(draw)), mLibrary(library) {}

    /// From now on the model fails now and then, with any error.
    void haveModelsFail() { mModelsFail = true; }

    /// A fresh control with a fresh model on it.
    void open();
    /// What outlived the control; empty when all is well.
    std::string close();
    /// Does one thing. What turns out to be out of reach is not done.
    void act();

    std::string broken() { return mInvariants->broken(*mModel); }
    const std::string& last() const { return mLast; }
    int done() const { return mDone; }
    /// How many grid columns held a definition at most.
    int mostColumns() const { return mMostColumns; }
    /// There is little left to do: no table is shown.
    bool idle();

private:
    using String = zandor::platform::String;

    std::int32_t number(std::int32_t from, std::int32_t to);
    bool chance(std::int32_t percent) { return number(1, 100) <= percent; }
    zandor::platform::headless::Toolkit& toolkit();
    zandor::platform::headless::Grid& grid();
    std::int16_t slot();
    std::int32_t entryOf(std::int16_t slot);
    /// An entry that is in view, mostly.
    std::int32_t reachEntry(std::int16_t slot);
    /// A cell that is in view, mostly.
    std::pair<std::int32_t, std::int32_t> reachCell();
    std::int32_t column();
    int columnsFilled();
    String text();
    zandor::platform::Ref<fake::Model> newModel();
    TalvikDBxZandor::Zandor& control() { return mStage->control(); }

    void moveTable();
    void resizeTable();
    void closeTable();
    void scrollSomething();
    void selectEntries();
    void pressEntry();
    void releaseEntry();
    void dragToTable();
    void dragToGrid();
    void menuOverTable();
    void menuOverCanvas();
    void menuOverGrid();
    void pressCanvas();
    void editCell();
    void useEditor();
    void resizeControl();
    void useGrid();
    void useComforts();
    void host();
    void armModel();
    void bind(const zandor::platform::Ref<fake::Model>& model);

    String chooseFromMenu(const std::vector<Stage::Entry>& entries);
    void answerDialog();
    void hear();
    std::pair<float, float> placeOnCanvas();

    const Draw mDraw;
    fake::Library& mLibrary;
    std::unique_ptr<Stage> mStage;
    std::unique_ptr<Invariants> mInvariants;
    zandor::platform::Ref<fake::Model> mModel;
    bool mModelsFail = false;
    bool mCalm = false; ///< no table is closed, so that the grid fills up
    std::string mLast;
    int mDone = 0;
    int mMostColumns = 0;
};

#pragma once

#include "Invariants.h"
#include "support/Stage.h"

#include <Zandor/headless/User.h>

#include <functional>

/// What a host may do while its code runs.
enum class HostAction {
    bindsAnotherModel,
    bindsNothing,
    bindsTheSameModel,
    terminates,
    closesATable,
    removesAJoin,
    setsOnlyJoin,
    showsTheModelAnew,
    destroysTheControl,
};

inline constexpr HostAction hostActions[] = {
    HostAction::bindsAnotherModel, HostAction::bindsNothing,      HostAction::bindsTheSameModel,
    HostAction::terminates,        HostAction::closesATable,      HostAction::removesAJoin,
    HostAction::setsOnlyJoin,      HostAction::showsTheModelAnew, HostAction::destroysTheControl,
};
const char* name(HostAction action);

/// A control between a host and a user, with every trace on. Each place where the host's code can
/// run is counted, and at one of them the host does something.
class HostedControl {
public:
    /// What fills the model that is shown first.
    using Fill = void (*)(fake::Model&);
    /// Three tables, a join and two definitions.
    static void fill(fake::Model& model);

    explicit HostedControl(Fill fillModel = fill);
    ~HostedControl();

    /// From now on: count the places, and at the nth of them (from 1) do something.
    void watch(int place = 0, HostAction action = HostAction::bindsNothing);
    int places() const { return mPlaces; }
    /// What the place was that the host acted at.
    const std::string& where() const { return mWhere; }
    /// Whether anything of toolkit, model or host was called after the control had been destroyed.
    const std::string& calledAfterTheEnd() const { return mCalledAfterTheEnd; }

    bool gone() const { return mGone; }
    /// One thing that the user or the host does; what turns out to be out of reach is not done.
    void step(const std::function<void()>& deed);
    /// What is broken, at the end.
    std::string broken();

    TalvikDBxZandor::Zandor& control() { return *mControl; }
    Invariants& invariants() { return *mInvariants; }
    /// From now on the control asks the host.
    void ask();
    void bind(const zandor::platform::Ref<fake::Model>& model);
    void destroy();

    fake::Library library;
    zandor::platform::Ref<fake::Model> model;
    const std::unique_ptr<Stage> stage = Stage::open(library);
    zandor::platform::headless::Toolkit& toolkit;
    zandor::platform::headless::User user{toolkit};
    /// A host that changes the model itself shows it anew at the end, in case it got in its own
    /// way.
    bool changesTheModel = false;
    std::string chosen;             ///< from the menu that opens next
    std::function<void()> inDialog; ///< while the dialog stands open

private:
    class Answers;

    static bool reachesTheHost(const std::string& toolkitCall);
    void at(const std::string& place);
    void act();
    zandor::platform::Ref<fake::Model> newModel(Fill fillModel = fill);
    zandor::platform::Ref<fake::Model> bound();

    TalvikDBxZandor::Zandor* mControl = nullptr;
    std::unique_ptr<Invariants> mInvariants;
    zandor::platform::Ref<fake::Model> mOther;
    int mPlaces = 0;
    int mPlace = 0;
    bool mWatching = false;
    bool mEnding = false;
    bool mGone = false;
    HostAction mAction = HostAction::bindsNothing;
    std::string mWhere;
    std::string mCalledAfterTheEnd;
};

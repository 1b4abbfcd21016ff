#include "HostedControl.h"

#include "support/Backstage.h"
#include "support/Tables.h"

#include <new>
#include <unordered_map>
#include <unordered_set>
#include <utility>

using namespace zandor;

using Backstage = TalvikDBxZandor::ZandorBackstage;
using platform::Ref;
using platform::headless::PopupMenu;

const char* name(HostAction action) {
    switch (action) {
    case HostAction::bindsAnotherModel: return "binds another model";
    case HostAction::bindsNothing: return "binds nothing";
    case HostAction::bindsTheSameModel: return "binds the same model";
    case HostAction::terminates: return "terminates";
    case HostAction::closesATable: return "closes a table";
    case HostAction::removesAJoin: return "removes a join";
    case HostAction::setsOnlyJoin: return "sets OnlyJoin";
    case HostAction::showsTheModelAnew: return "shows the model anew";
    case HostAction::destroysTheControl: return "destroys the control";
    }
    return "";
}

HostedControl::HostedControl(Fill fillModel)
    : model(newModel(fillModel)),
      toolkit(dynamic_cast<platform::headless::Toolkit&>(stage->toolkit())),
      mControl(&stage->control()), mOther(newModel()) {
    stage->onMenu = [this](const auto&) {
        const std::string entry = std::exchange(chosen, {});
        at("menu");
        return platform::fromUtf8(entry);
    };
    stage->onDialog = [this] {
        at("dialog");
        if (const auto use = std::exchange(inDialog, {}); use && !gone()) use();
    };
    stage->onEvent = [this] { at("event"); };
    library.calls->onPass = [this](const std::string& call) { at(call); };
    toolkit.faults.onPass = [this](const std::string& call) {
        // Each call of an array's element passes a second time, without its index.
        if (call.starts_with("lstTable.")) return;
        if (gone()) return at(call);
        if (!mWatching) return;
        // The same few hundred names again and again.
        static std::unordered_map<std::string, bool> known;
        const auto [name, isNew] = known.try_emplace(call);
        if (isNew) name->second = reachesTheHost(call);
        if (name->second) at(call);
    };
    mControl->OnlyJoin(false);
    mInvariants = std::make_unique<Invariants>(*mControl, toolkit);
}

HostedControl::~HostedControl() {
    mWatching = false;
    destroy();
    mInvariants.reset();
    library.calls->onPass = nullptr;
    toolkit.faults.onPass = nullptr;
}

void HostedControl::fill(fake::Model& model) {
    const auto orders = addOrders(model);
    orders->selected = 1;
    orders->column(u"ID").selected = true;
    orders->column(u"ID").marker = true;
    const auto customers = addCustomers(model);
    addParts(model);
    model.join(orders, u"CUSTOMER", customers, u"ID");
    model.definition(orders, u"ID", {u"> 1"});
    model.definition(customers, u"NAME");
}

Ref<fake::Model> HostedControl::newModel(Fill fillModel) {
    auto made = library.newModel();
    fillModel(*made);
    return made;
}

void HostedControl::watch(int place, HostAction action) {
    mControl->DebugSwitch(1);
    mPlace = place;
    mAction = action;
    mPlaces = 0;
    mWatching = true;
}

/// Of the toolkit's calls those that show something modal or may move the keyboard's focus or the
/// place of a window, of which hosts can be told; lines and marks have no window.
bool HostedControl::reachesTheHost(const std::string& toolkitCall) {
    if (toolkitCall.starts_with("linJoin") || toolkitCall.starts_with("shpJoin")) return false;
    static const std::unordered_set<std::string> members = {
        "MsgBox",  "SendMessage", "PopupMenuAtMouse", "ShowModal", "Hide",     "Drag",   "SetFocus",
        "Visible", "Visible=",    "Enabled",          "setBounds", "Max=",     "Value=", "Unload",
        "ZOrder",  "Default",     "EnsureVisible",    "Activated", "Complete",
    };
    const auto dot = toolkitCall.rfind('.');
    const std::string member = dot == std::string::npos ? toolkitCall : toolkitCall.substr(dot + 1);
    return members.contains(member);
}

void HostedControl::at(const std::string& place) {
    if (gone()) {
        if (mCalledAfterTheEnd.empty()) mCalledAfterTheEnd = place;
        return;
    }
    if (!mWatching || ++mPlaces != mPlace) return;
    mWhere = place;
    // What the host does reaches its own code again; that is not counted.
    mWatching = false;
    act();
}

void HostedControl::act() {
    switch (mAction) {
    case HostAction::bindsAnotherModel: return bind(mOther);
    case HostAction::bindsNothing: return bind(nullptr);
    case HostAction::bindsTheSameModel: return bind(bound());
    case HostAction::terminates: return mControl->Terminate();
    case HostAction::closesATable:
        for (const auto& [slot, table] : Backstage::lstTable(*mControl))
            if (slot != 0) return Backstage::lstTable_CloseClick(*mControl, std::int16_t(slot));
        return;
    case HostAction::removesAJoin:
        if (Backstage::mJoinLines(*mControl).Count() > 0)
            Backstage::RemoveJoin(*mControl, Backstage::mJoinLines(*mControl).Item(1));
        return;
    case HostAction::setsOnlyJoin: return mControl->OnlyJoin(!mControl->OnlyJoin());
    case HostAction::showsTheModelAnew: return mControl->ShowAnew();
    case HostAction::destroysTheControl: mInvariants->watch(); return destroy();
    }
}

/// Says yes to everything, and has two entries in the menu.
class HostedControl::Answers final : public TalvikDBxZandor::Questions {
public:
    explicit Answers(HostedControl& hosted) : mHosted(hosted) {}
    bool MayJoin(const TalvikDBxZandor::JoinEnd&, const TalvikDBxZandor::JoinEnd&) override {
        return asked("MayJoin");
    }
    bool MayRemoveJoin(const Ref<TalvikZandorLib::ZDJoin>&) override {
        return asked("MayRemoveJoin");
    }
    bool MayCloseTable(const Ref<TalvikZandorLib::ZDTable>&) override {
        return asked("MayCloseTable");
    }
    bool MayComeOut(const Ref<TalvikZandorLib::ZDColumn>&) override { return asked("MayComeOut"); }
    bool MayRemoveColumn(const Ref<TalvikZandorLib::ZDColumnDefinition>&) override {
        return asked("MayRemoveColumn");
    }
    std::vector<TalvikDBxZandor::HostEntry>
    MenuEntries(const TalvikDBxZandor::MenuPlace&) override {
        asked("MenuEntries");
        return {{u"One", [this] { asked("an entry"); }}, {u"Two", {}}};
    }

private:
    bool asked(const std::string& question) {
        mHosted.at(question);
        return true;
    }

    HostedControl& mHosted;
};

void HostedControl::ask() { mControl->Ask(std::make_shared<Answers>(*this)); }

void HostedControl::bind(const Ref<fake::Model>& shown) {
    mControl->P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(shown));
}

Ref<fake::Model> HostedControl::bound() {
    return std::dynamic_pointer_cast<fake::Model>(
        std::shared_ptr<TalvikZandorLib::Zandor>(Backstage::mModel(*mControl)));
}

void HostedControl::destroy() {
    // One end is enough, for a host too.
    if (std::exchange(mEnding, true)) return;
    mControl->End();
    mGone = true;
    stage->closeControl();
}

void HostedControl::step(const std::function<void()>& deed) {
    if (gone()) return;
    // Nothing is counted any more, so nobody need be told of each call.
    if (!mWhere.empty()) toolkit.faults.onPass = nullptr;
    // What the user's hand is on stays until it is off it.
    const TalvikDBxZandor::Life::Procedure hand(Backstage::mLife(*mControl));
    try {
        deed();
    } catch (const std::logic_error&) {
        // The host has taken away what the user was about to touch.
    } catch (const platform::RuntimeError&) {
        // Or made it what cannot be touched.
    } catch (const std::bad_alloc&) {
        // Or there was no memory left for the hand itself.
    }
}

std::string HostedControl::broken() {
    mWatching = false;
    if (gone()) return mInvariants->survivors();
    mControl->DebugSwitch(0);
    // What was shown anew in the middle of a change has to be shown once more.
    if (changesTheModel || mAction == HostAction::showsTheModelAnew) mControl->ShowAnew();
    std::string all = mInvariants->broken(*bound());
    // And it goes on as ever.
    toolkit.faults.disarm();
    library.calls->disarm();
    mControl->OnlyJoin(false);
    const std::size_t boxes = toolkit.boxes().size();
    model = newModel();
    bind(model);
    if (toolkit.boxes().size() != boxes)
        all += "binding anew: " + platform::toUtf8(toolkit.boxes()[boxes].prompt);
    return all + mInvariants->broken(*model);
}

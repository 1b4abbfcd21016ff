#include "HostedControl.h"

#include "support/Backstage.h"

#include <algorithm>
#include <array>
#include <utility>

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
    case HostAction::destroysTheControl: return "destroys the control";
    }
    return "";
}

HostedControl::HostedControl() : model(newModel()), mOther(newModel()) {
    toolkit.surface().resize(12000, 9000);
    toolkit.onMenu = [this](const PopupMenu&) {
        const std::string entry = std::exchange(chosen, {});
        at("menu");
        return entry;
    };
    toolkit.onDialog = [this](auto&) {
        at("dialog");
        if (const auto use = std::exchange(inDialog, {}); use && !gone()) use();
    };
    library.calls->onPass = [this](const std::string& call) { at(call); };
    toolkit.faults.onPass = [this](const std::string& call) {
        // Each call of an array's element passes a second time, without its index.
        if (call.starts_with("lstTable.")) return;
        if (gone() || reachesTheHost(call)) at(call);
    };
    mHouse = std::make_shared<House>();
    mHouse->control.emplace(toolkit, library, static_cast<TalvikDBxZandor::ZandorEvents&>(*this),
                            mHouse);
    mControl = &*mHouse->control;
    toolkit.comforts.attach(*mControl);
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

Ref<fake::Model> HostedControl::newModel() {
    auto made = library.newModel();
    const auto orders = made->table(u"ORDERS", {u"*", u"ID", u"CUSTOMER", u"TOTAL"});
    orders->place(300, 300, 2400, 2400);
    orders->selected = 1;
    orders->column(u"ID").selected = true;
    orders->column(u"ID").marker = true;
    const auto customers = made->table(u"CUSTOMERS", {u"*", u"ID", u"NAME"});
    customers->place(6000, 300, 2400, 2400);
    made->table(u"PARTS", {u"*", u"NO", u"TITLE"})->place(9000, 300, 2100, 2400);
    made->join(orders, u"CUSTOMER", customers, u"ID");
    made->definition(orders, u"ID", {u"> 1"});
    made->definition(customers, u"NAME");
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
    static constexpr std::array members = {
        "MsgBox",  "SendMessage", "PopupMenuAtMouse", "ShowModal", "Hide",     "Drag",   "SetFocus",
        "Visible", "Visible=",    "Enabled",          "setBounds", "Max=",     "Value=", "Unload",
        "ZOrder",  "Default",     "EnsureVisible",    "Activated", "Complete",
    };
    const auto dot = toolkitCall.rfind('.');
    const std::string member = dot == std::string::npos ? toolkitCall : toolkitCall.substr(dot + 1);
    return std::find(members.begin(), members.end(), member) != members.end();
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

void HostedControl::Raise(TalvikDBxZandor::Event, const TalvikDBxZandor::EventArguments&) {
    at("event");
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
    case HostAction::destroysTheControl: mInvariants->watch(); return destroy();
    }
}

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
    toolkit.close();
    toolkit.comforts.detach();
    mLeft = std::move(mHouse);
}

void HostedControl::step(const std::function<void()>& deed) {
    if (gone()) return;
    try {
        deed();
    } catch (const std::logic_error&) {
        // The host has taken away what the user was about to touch.
    } catch (const platform::RuntimeError&) {
        // Or made it what cannot be touched.
    }
    mLeft.reset();
}

std::string HostedControl::broken() {
    mWatching = false;
    if (gone()) return mInvariants->survivors();
    mControl->DebugSwitch(0);
    std::string all = mInvariants->broken(*bound());
    // And it goes on as ever.
    toolkit.faults.disarm();
    library.calls->disarm();
    mControl->OnlyJoin(false);
    const std::size_t boxes = toolkit.boxes().size();
    model = newModel();
    bind(model);
    if (toolkit.boxes().size() != boxes)
        all += "binding anew: " + platform::toUtf8(toolkit.boxes().back().prompt);
    return all + mInvariants->broken(*model);
}

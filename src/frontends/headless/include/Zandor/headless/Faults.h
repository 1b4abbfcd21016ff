#pragma once

#include <Zandor/headless/export.h>

#include <exception>
#include <functional>
#include <map>
#include <string>
#include <vector>

namespace zandor::platform::headless {

/// Makes named calls fail, and remembers which were made. Calls are named "owner.member".
class ZANDOR_HEADLESS_EXPORT Faults {
public:
    /// The nth call of that name from now on throws `error` and does nothing else; the ones before
    /// and after it work. Arming a name again replaces what was armed.
    template <class Error>
    void failNext(const std::string& call, const Error& error, int nth = 1) {
        mArmed[call] = {nth, std::make_exception_ptr(error)};
        weigh();
    }

    /// Whether a failure of that name has been armed and not met yet.
    bool isArmed(const std::string& call) const { return mArmed.count(call) != 0; }
    void disarm() {
        mArmed.clear();
        weigh();
    }

    /// Off at first, because every call costs a text while it is on.
    void remember(bool on) {
        mRemembering = on;
        weigh();
    }
    const std::vector<std::string>& calls() const { return mCalls; }
    void forget() { mCalls.clear(); }

    /// Called with the name of each call before it does anything.
    std::function<void(const std::string& call)> onPass;

    /// False while nobody asks for names: the caller need not make one.
    bool listening() const { return mWanted || onPass; }

    void pass(const std::string& call) {
        if (onPass) onPass(call);
        if (mRemembering) mCalls.push_back(call);
        const auto armed = mArmed.find(call);
        if (armed == mArmed.end() || --armed->second.countdown > 0) return;
        const std::exception_ptr error = armed->second.error;
        mArmed.erase(armed);
        weigh();
        std::rethrow_exception(error);
    }

private:
    struct Armed {
        int countdown = 1;
        std::exception_ptr error;
    };

    void weigh() { mWanted = mRemembering || !mArmed.empty(); }

    std::map<std::string, Armed> mArmed;
    std::vector<std::string> mCalls;
    bool mRemembering = false;
    bool mWanted = false; ///< whether a name is remembered or armed: each call asks
};

} // namespace zandor::platform::headless

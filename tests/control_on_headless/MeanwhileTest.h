#pragma once

#include "control/GridStage.h"

namespace gridstage {

/// A host that does something while its model is called.
class MeanwhileTest : public GridTest {
protected:
    ~MeanwhileTest() override { library.calls->onPass = nullptr; }

    /// At the nth call of a member from now on, once.
    void when(const std::string& member, const std::function<void()>& deed, int nth = 1) {
        library.calls->onPass = [this, member, deed, nth](const std::string& call) mutable {
            if (call != member || --nth > 0) return;
            const auto now = deed; // this goes
            library.calls->onPass = nullptr;
            now();
        };
    }
};

} // namespace gridstage

#pragma once

#include "frontends/windows/automation/com/Counted.h"
#include "frontends/windows/automation/server/classes.h"

namespace zandor::automation {

/// Makes objects of one class. Nothing aggregates them.
class ClassFactory final : public Counted<IClassFactory> {
public:
    explicit ClassFactory(const CreatableClass& made) : mMade(made) {}

    STDMETHODIMP CreateInstance(IUnknown* outer, REFIID iid, void** object) override;
    STDMETHODIMP LockServer(BOOL lock) override;

private:
    const CreatableClass& mMade;
};

} // namespace zandor::automation

#pragma once

#include "frontends/windows/automation/com/Module.h"
#include "frontends/windows/automation/server/classes.h"

#include <atomic>

namespace zandor::automation {

/// Makes objects of one class. Nothing aggregates them.
class ClassFactory final : public IClassFactory {
public:
    explicit ClassFactory(const CreatableClass& made) : mMade(made) {}

    STDMETHODIMP QueryInterface(REFIID iid, void** object) override;
    STDMETHODIMP_(ULONG) AddRef() override;
    STDMETHODIMP_(ULONG) Release() override;
    STDMETHODIMP CreateInstance(IUnknown* outer, REFIID iid, void** object) override;
    STDMETHODIMP LockServer(BOOL lock) override;

private:
    const Keeping mKeeping;
    std::atomic<ULONG> mReferences = 0;
    const CreatableClass& mMade;
};

} // namespace zandor::automation

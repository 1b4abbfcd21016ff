#pragma once

#include "frontends/windows/automation/host/HostObject.h"
#include "frontends/windows/automation/model/Exchange.h"

#include <model.h>

namespace zandor::automation {

/// A collection of a host's: `Count`, `Item` by number and by key, `Remove` by key.
template <class T>
class HostCollection final : public HostObject, public TalvikZandorLib::EditableCollection<T> {
public:
    explicit HostCollection(IDispatch* object)
        : HostObject(object), mTyped(Held<_ZDCollection>::of(object)) {}

    std::int32_t Count() const override {
        return longOf(get(L"Count", mTyped, &_ZDCollection::get_Count));
    }
    platform::Ref<T> Item(std::int32_t position) const override { return item(Value(position)); }
    platform::Ref<T> Item(const platform::String& key) const override { return item(Value(key)); }
    void Remove(const platform::String& key) override {
        const Value named(key);
        if (mTyped)
            require(mTyped->Remove(named), mTyped.get(), __uuidof(_ZDCollection));
        else
            call(L"Remove", key);
    }

private:
    platform::Ref<T> item(Value index) const {
        if (!mTyped) return fromHost<T>(objectOf(call(L"Item", std::move(index))).get());
        Held<IDispatch> found;
        require(mTyped->Item(index, found.slot()), mTyped.get(), __uuidof(_ZDCollection));
        return fromHost<T>(found.get());
    }

    const Held<_ZDCollection> mTyped;
};

/// A collection that a host's object has as a member. The control asks for it again and again, and
/// holds no more than its place; each time it is what the host gives then.
template <class T>
class HostList final : public TalvikZandorLib::EditableCollection<T> {
public:
    std::int32_t Count() const override { return list()->Count(); }
    platform::Ref<T> Item(std::int32_t position) const override { return list()->Item(position); }
    platform::Ref<T> Item(const platform::String& key) const override { return list()->Item(key); }
    void Remove(const platform::String& key) override { list()->Remove(key); }

    /// Error 91 from its members where the host gives nothing.
    void give(const Held<IDispatch>& object) {
        if (mList && mList->dispatch().get() == object.get()) return;
        mList = object ? platform::makeRef<HostCollection<T>>(object.get())
                       : platform::Ref<HostCollection<T>>();
    }

private:
    // Held meanwhile, for the host may give another one while it is asked.
    platform::Ref<HostCollection<T>> list() const { return mList; }

    platform::Ref<HostCollection<T>> mList;
};

} // namespace zandor::automation

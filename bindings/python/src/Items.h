#pragma once

#include "PythonError.h"
#include "conversions.h"

#include <memory>

namespace zandor::python {

/// A collection of the ready-made model, whatever it lists, with what it is a part of.
class Items {
public:
    virtual ~Items() = default;
    virtual std::int32_t Count() const = 0;
    virtual Object Item(std::int32_t position) const = 0;
    virtual Object Item(const platform::String& key) const = 0;
    /// Error 438 where nothing can be removed.
    virtual void Remove(const platform::String& key) = 0;
};

template <class T, class List>
class ItemsOf final : public Items {
public:
    ItemsOf(List& list, std::shared_ptr<void> owner) : mList(list), mOwner(std::move(owner)) {}

    std::int32_t Count() const override { return mList.Count(); }
    Object Item(std::int32_t position) const override { return toPython(mList.Item(position)); }
    Object Item(const platform::String& key) const override { return toPython(mList.Item(key)); }
    void Remove(const platform::String& key) override {
        if constexpr (requires { mList.Remove(key); })
            mList.Remove(key);
        else
            throw platform::errors::unsupportedMember();
    }

private:
    List& mList;
    const std::shared_ptr<void> mOwner;
};

/// The collection as a part of what a wrapper is for.
template <class T>
Items* itemsOf(TalvikZandorLib::Collection<T>& list, PyObject* owner) {
    return new ItemsOf<T, TalvikZandorLib::Collection<T>>(list, held(owner));
}
template <class T>
Items* itemsOf(TalvikZandorLib::EditableCollection<T>& list, PyObject* owner) {
    return new ItemsOf<T, TalvikZandorLib::EditableCollection<T>>(list, held(owner));
}

} // namespace zandor::python

using zandor::python::Items;

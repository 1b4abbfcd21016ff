#pragma once

#include "frontends/windows/automation/com/Dual.h"
#include "frontends/windows/automation/com/ids.h"

#include <Zandor/platform/Ref.h>

#include <map>
#include <mutex>

namespace zandor::automation {

/// By this interface, of no type library, the library knows its own objects among those that a host
/// hands over.
class Own : public IUnknown {
public:
    virtual ~Own() = default;
};

/// One of our own objects that stands for one of the model's. There is one of them at a time for
/// one object of the model, so that a host may ask whether two are the same.
template <class T>
class Holds : public Own {
public:
    const platform::Ref<T>& object() const { return mObject; }

    /// Of an object of the model, the one that there is; nothing where there is none.
    static Held<IDispatch> known(const T& object) {
        const std::lock_guard lock(mutex());
        const auto found = all().find(&object);
        return found == all().end() ? Held<IDispatch>() : Held<IDispatch>(found->second);
    }

protected:
    Holds(platform::Ref<T> object, IDispatch* self) : mObject(std::move(object)) {
        const std::lock_guard lock(mutex());
        all()[mObject.get()] = self;
    }
    ~Holds() override {
        const std::lock_guard lock(mutex());
        all().erase(mObject.get());
    }

private:
    static std::mutex& mutex() {
        static std::mutex guard;
        return guard;
    }
    static std::map<const T*, IDispatch*>& all() {
        static std::map<const T*, IDispatch*> objects;
        return objects;
    }

    const platform::Ref<T> mObject; ///< never nothing
};

/// The model's object behind a host's, where it is one of our own; nothing otherwise.
template <class T>
platform::Ref<T> ownObject(IDispatch* object) {
    Held<Own> own;
    if (!object || FAILED(object->QueryInterface(ids::own, own.slotOfAny()))) return {};
    const auto* const holder = dynamic_cast<const Holds<T>*>(own.get());
    return holder ? holder->object() : platform::Ref<T>();
}

/// An object of the model behind its dual interface.
template <class Interface, class T>
class Wrapper : public Dual<Interface>, public Holds<T> {
public:
    explicit Wrapper(platform::Ref<T> object)
        : Holds<T>(std::move(object), static_cast<Interface*>(this)) {}

    // Two of its bases are counted.
    STDMETHODIMP QueryInterface(REFIID iid, void** object) override {
        return Dual<Interface>::QueryInterface(iid, object);
    }
    STDMETHODIMP_(ULONG) AddRef() override { return Dual<Interface>::AddRef(); }
    STDMETHODIMP_(ULONG) Release() override { return Dual<Interface>::Release(); }

protected:
    void* findMore(REFIID iid) override {
        return iid == ids::own ? static_cast<Own*>(this) : nullptr;
    }
};

} // namespace zandor::automation

#pragma once

#include "frontends/windows/automation/com/system.h"

#include <utility>

namespace zandor::automation {

/// A counted reference to an object of the system's kind.
template <class T>
class Held {
public:
    Held() = default;
    Held(T* object) : mObject(object) {
        if (mObject) mObject->AddRef();
    }
    Held(const Held& other) : Held(other.mObject) {}
    Held(Held&& other) noexcept : mObject(std::exchange(other.mObject, nullptr)) {}
    Held& operator=(Held other) noexcept {
        std::swap(mObject, other.mObject);
        return *this;
    }
    ~Held() {
        if (mObject) mObject->Release();
    }

    /// Takes over a reference that was counted already.
    static Held taken(T* object) {
        Held held;
        held.mObject = object;
        return held;
    }
    /// The interface of an object, or nothing where it has none.
    static Held of(IUnknown* object) {
        Held held;
        if (!object || FAILED(object->QueryInterface(__uuidof(T), held.slotOfAny())))
            held.mObject = nullptr;
        return held;
    }

    T* get() const { return mObject; }
    T* operator->() const { return mObject; }
    explicit operator bool() const { return mObject != nullptr; }
    /// One reference more, for who asked.
    T* copy() const {
        if (mObject) mObject->AddRef();
        return mObject;
    }
    /// The reference itself, for who asked.
    T* detach() { return std::exchange(mObject, nullptr); }
    /// Where a call puts a counted reference.
    T** slot() {
        *this = {};
        return &mObject;
    }
    void** slotOfAny() { return reinterpret_cast<void**>(slot()); }

private:
    T* mObject = nullptr;
};

} // namespace zandor::automation

#pragma once

#include <Zandor/control/Life.h>
#include <Zandor/platform/Ref.h>

namespace TalvikDBxZandor {

/// Something that a control reaches through a pointer: each use ends the procedure at hand in quiet
/// once the control has ended. Through a counted reference that holds nothing it is error 91.
template <class T, class Pointer>
class Reached {
public:
    Reached() = default;
    Reached(const Life& life, Pointer pointer) : mLife(&life), mPointer(std::move(pointer)) {}

    T& operator*() const {
        if (mLife) mLife->check();
        return *mPointer;
    }
    T* operator->() const { return &**this; }

    // What only looks at the pointer is always safe.
    explicit operator bool() const { return mPointer != nullptr; }
    const Pointer& pointer() const { return mPointer; }
    operator const Pointer&() const { return mPointer; }
    auto get() const { return mPointer.get(); }

private:
    const Life* mLife = nullptr;
    Pointer mPointer{};
};

/// A constituent of the control.
template <class T>
using Part = Reached<T, std::unique_ptr<T>>;

/// What a procedure goes on to use: an element of a control array, an entry, an object of the
/// model.
template <class T>
using Held = Reached<T, platform::Ref<T>>;

/// What the control was given for its whole life.
template <class T>
using Given = Reached<T, T*>;

template <class T>
Held<T> hold(const Life& life, const platform::Ref<T>& reference) {
    return {life, reference};
}

} // namespace TalvikDBxZandor

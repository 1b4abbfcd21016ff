#pragma once

#include <Zandor/control/Life.h>
#include <Zandor/platform/Ref.h>

#include <functional>
#include <map>

namespace TalvikDBxZandor {

/// A control array: element 0 exists from design time on, further ones are loaded and unloaded at
/// run time. Walking it goes by ascending index; a walk that can reach the host's code on its way
/// is made over a copy. Each use ends the procedure at hand in quiet once the control has ended.
template <class T>
class ControlArray {
public:
    /// Makes the element of an index; pattern is element 0, nullptr when that is the one to make.
    using Factory = std::function<platform::Ref<T>(std::int16_t index, const T* pattern)>;

    ControlArray(const Life& life, Factory factory) : mLife(life), mFactory(std::move(factory)) {
        mElements.emplace(std::int16_t{0}, mFactory(0, nullptr));
    }

    /// Error 360 when the element is loaded already.
    void Load(std::int16_t index) {
        mLife.check();
        if (mElements.count(index)) throw platform::errors::alreadyLoaded();
        mElements.emplace(index, mFactory(index, mElements.at(0).get()));
    }

    /// Error 340 when there is no such element, 362 for the one of design time.
    void Unload(std::int16_t index) {
        mLife.check();
        if (index == 0) throw platform::errors::cannotUnloadDesignElement();
        // Out of the array first: the end of an element may be told to the host.
        const auto gone = mElements.extract(index);
        if (gone.empty()) throw platform::errors::noSuchElement(index);
    }

    /// Error 340 when there is no such element.
    const platform::Ref<T>& operator()(std::int32_t index) const {
        const auto at = find(index);
        if (at == mElements.end()) throw platform::errors::noSuchElement(index);
        return at->second;
    }

    /// Nothing when there is no such element.
    platform::Ref<T> Find(std::int32_t index) const {
        const auto at = find(index);
        return at == mElements.end() ? platform::Ref<T>() : at->second;
    }

    std::size_t Count() const { return mElements.size(); }
    auto begin() const {
        mLife.check();
        return mElements.begin();
    }
    auto end() const { return mElements.end(); }

private:
    auto find(std::int32_t index) const {
        mLife.check();
        return index == static_cast<std::int16_t>(index)
                   ? mElements.find(static_cast<std::int16_t>(index))
                   : mElements.end();
    }

    const Life& mLife;
    Factory mFactory;
    std::map<std::int16_t, platform::Ref<T>> mElements;
};

} // namespace TalvikDBxZandor

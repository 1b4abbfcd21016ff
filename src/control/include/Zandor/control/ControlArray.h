#pragma once

#include <Zandor/control/Life.h>
#include <Zandor/platform/Ref.h>

#include <algorithm>
#include <functional>
#include <map>
#include <vector>

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
        add(0, mFactory(0, nullptr));
    }

    /// Error 360 when the element is loaded already.
    void Load(std::int16_t index) {
        mLife.check();
        if (mElements.count(index)) throw platform::errors::alreadyLoaded();
        add(index, mFactory(index, mElements.at(0).get()));
    }

    /// Error 340 when there is no such element, 362 for the one of design time.
    void Unload(std::int16_t index) {
        mLife.check();
        if (index == 0) throw platform::errors::cannotUnloadDesignElement();
        // Out of the array first: the end of an element may be told to the host.
        const auto gone = mElements.extract(index);
        if (gone.empty()) throw platform::errors::noSuchElement(index);
        if (index > 0) mPlaces[static_cast<std::size_t>(index)] = nullptr;
    }

    /// Error 340 when there is no such element.
    const platform::Ref<T>& operator()(std::int32_t index) const {
        const auto* const at = find(index);
        if (!at) throw platform::errors::noSuchElement(index);
        return *at;
    }

    /// Nothing when there is no such element.
    platform::Ref<T> Find(std::int32_t index) const {
        const auto* const at = find(index);
        return at ? *at : platform::Ref<T>();
    }

    /// The same without holding it: for a use that nothing unloads it in.
    T* Peek(std::int32_t index) const {
        const auto* const at = find(index);
        return at ? at->get() : nullptr;
    }

    std::size_t Count() const { return mElements.size(); }
    auto begin() const {
        mLife.check();
        return mElements.begin();
    }
    auto end() const { return mElements.end(); }

private:
    void add(std::int16_t index, platform::Ref<T> element) {
        const auto place = static_cast<std::size_t>(std::max<std::int16_t>(index, 0));
        if (place >= mPlaces.size()) mPlaces.resize(place + 1);
        const auto at = mElements.emplace(index, std::move(element)).first;
        if (index >= 0) mPlaces[place] = &at->second;
    }

    const platform::Ref<T>* find(std::int32_t index) const {
        mLife.check();
        if (index >= 0)
            return static_cast<std::size_t>(index) < mPlaces.size()
                       ? mPlaces[static_cast<std::size_t>(index)]
                       : nullptr;
        if (index != static_cast<std::int16_t>(index)) return nullptr;
        const auto at = mElements.find(static_cast<std::int16_t>(index));
        return at == mElements.end() ? nullptr : &at->second;
    }

    const Life& mLife;
    Factory mFactory;
    std::map<std::int16_t, platform::Ref<T>> mElements;
    std::vector<const platform::Ref<T>*> mPlaces; ///< of the elements, by index from 0 on
};

} // namespace TalvikDBxZandor

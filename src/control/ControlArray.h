#pragma once

#include "platform/Ref.h"

#include <functional>
#include <map>

namespace TalvikDBxZandor {

/// A control array: element 0 exists from design time on, further ones are loaded and unloaded at
/// run time. Walking it goes by ascending index.
template <class T>
class ControlArray {
public:
    /// Makes the element of an index; pattern is element 0, nullptr when that is the one to make.
    using Factory = std::function<platform::Ref<T>(std::int16_t index, const T* pattern)>;

    explicit ControlArray(Factory factory) : mFactory(std::move(factory)) {
        mElements.emplace(std::int16_t{0}, mFactory(0, nullptr));
    }

    /// Error 360 when the element is loaded already.
    void Load(std::int16_t index) {
        if (mElements.count(index)) throw platform::errors::alreadyLoaded();
        mElements.emplace(index, mFactory(index, mElements.at(0).get()));
    }

    /// Error 340 when there is no such element, 362 for the one of design time.
    void Unload(std::int16_t index) {
        if (index == 0) throw platform::errors::cannotUnloadDesignElement();
        if (mElements.erase(index) == 0) throw platform::errors::noSuchElement(index);
    }

    /// Error 340 when there is no such element.
    const platform::Ref<T>& operator()(std::int32_t index) const {
        const auto at = index == static_cast<std::int16_t>(index)
                            ? mElements.find(static_cast<std::int16_t>(index))
                            : mElements.end();
        if (at == mElements.end()) throw platform::errors::noSuchElement(index);
        return at->second;
    }

    std::size_t Count() const { return mElements.size(); }
    auto begin() const { return mElements.begin(); }
    auto end() const { return mElements.end(); }

private:
    Factory mFactory;
    std::map<std::int16_t, platform::Ref<T>> mElements;
};

} // namespace TalvikDBxZandor

#pragma once

#include <Zandor/control/Life.h>
#include <Zandor/platform/Ref.h>

#include <deque>
#include <functional>
#include <iterator>
#include <limits>
#include <utility>

namespace TalvikDBxZandor {

/// A control array: element 0 exists from design time on, further ones are loaded and unloaded at
/// run time. Walking it goes by ascending index; a walk that can reach the host's code on its way
/// is made over a copy. Each use ends the procedure at hand in quiet once the control has ended.
template <class T>
class ControlArray {
    // Its elements stay where they are when another one comes.
    using Elements = std::deque<platform::Ref<T>>;
    static constexpr std::size_t behindAll = std::numeric_limits<std::size_t>::max();

public:
    /// Makes the element of an index; pattern is element 0, nullptr when that is the one to make.
    using Factory = std::function<platform::Ref<T>(std::int16_t index, const T* pattern)>;

    ControlArray(const Life& life, Factory factory) : mLife(life), mFactory(std::move(factory)) {
        add(0, mFactory(0, nullptr));
    }

    /// Error 360 when the element is loaded already, 340 for an index below 0.
    void Load(std::int16_t index) {
        mLife.check();
        if (index < 0) throw platform::errors::noSuchElement(index);
        if (find(index)) throw platform::errors::alreadyLoaded();
        add(index, mFactory(index, mElements.front().get()));
    }

    /// Error 340 when there is no such element, 362 for the one of design time.
    void Unload(std::int16_t index) {
        mLife.check();
        if (index == 0) throw platform::errors::cannotUnloadDesignElement();
        if (!find(index)) throw platform::errors::noSuchElement(index);
        // Out of the array first: the end of an element may be told to the host.
        const auto gone = std::exchange(mElements[static_cast<std::size_t>(index)], nullptr);
        --mCount;
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

    std::size_t Count() const { return mCount; }

    /// Stands at an element, and tells its index with it. What is loaded and unloaded meanwhile
    /// leaves it where it stands.
    class Iterator {
    public:
        using iterator_category = std::input_iterator_tag;
        using value_type = std::pair<std::int16_t, platform::Ref<T>>;
        using reference = std::pair<std::int16_t, const platform::Ref<T>&>;
        using difference_type = std::ptrdiff_t;
        using pointer = void;

        Iterator(const Elements& elements, std::size_t place)
            : mElements(&elements), mPlace(place) {
            passGaps();
        }
        reference operator*() const {
            return {static_cast<std::int16_t>(mPlace), (*mElements)[mPlace]};
        }
        Iterator& operator++() {
            ++mPlace;
            passGaps();
            return *this;
        }
        friend bool operator==(const Iterator&, const Iterator&) = default;

    private:
        void passGaps() {
            while (mPlace < mElements->size() && !(*mElements)[mPlace].get()) ++mPlace;
            if (mPlace >= mElements->size()) mPlace = behindAll;
        }

        const Elements* mElements;
        std::size_t mPlace;
    };
    Iterator begin() const {
        mLife.check();
        return {mElements, 0};
    }
    Iterator end() const { return {mElements, behindAll}; }

private:
    void add(std::int16_t index, platform::Ref<T> element) {
        const auto place = static_cast<std::size_t>(index);
        if (place >= mElements.size()) mElements.resize(place + 1);
        mElements[place] = std::move(element);
        ++mCount;
    }

    const platform::Ref<T>* find(std::int32_t index) const {
        mLife.check();
        const auto place = static_cast<std::size_t>(index);
        return index >= 0 && place < mElements.size() && mElements[place].get() ? &mElements[place]
                                                                                : nullptr;
    }

    const Life& mLife;
    Factory mFactory;
    Elements mElements; ///< by index; gaps hold nothing
    std::size_t mCount = 0;
};

} // namespace TalvikDBxZandor

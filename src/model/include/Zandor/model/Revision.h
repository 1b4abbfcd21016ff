#pragma once

#include <Zandor/model/export.h>

#include <cstdint>
#include <list>
#include <memory>
#include <vector>

namespace zandor::model {

class Revision;

/// Which objects of a query have changed, and when: the longer ago, the further behind. To ask it
/// takes as long as there are answers, however large the query is.
class ZANDOR_MODEL_EXPORT ChangeLog {
public:
    /// Counts the changes; 0 is before the first.
    using Moment = std::uint64_t;

    /// How many changes there were.
    Moment now() const { return mNow; }
    /// The revisions of what was changed after a moment, the latest first. Of an object that is
    /// gone there is none; one that was set back again is told like any other.
    std::vector<const Revision*> since(Moment moment) const;

private:
    friend class Revision;

    struct Entry {
        const Revision* revision;
        Moment changed;
    };
    std::list<Entry> mEntries; ///< the latest first
    Moment mNow = 0;
};

/// An object's place in the log of its query. One that stands in no query yet has no log, and is
/// changed without a trace.
class ZANDOR_MODEL_EXPORT Revision {
public:
    Revision() = default;
    Revision(const Revision&) = delete;
    Revision& operator=(const Revision&) = delete;
    ~Revision();

    /// From now on the object's changes are written there; entering is the first. Once there it
    /// stays there.
    void enter(const std::shared_ptr<ChangeLog>& log);
    /// The object has changed.
    void raise();

private:
    std::shared_ptr<ChangeLog> mLog;
    std::list<ChangeLog::Entry>::iterator mEntry;
};

/// A part of an object. To give it another value raises the object's revision, and there is no
/// other way to change it.
template <class T>
class Revised {
public:
    /// `revision` must outlive the part.
    explicit Revised(Revision& revision, T value = {})
        : mRevision(revision), mValue(std::move(value)) {}
    Revised(const Revised&) = delete;

    Revised& operator=(const Revised&) = delete;
    /// The same value changes nothing and raises nothing.
    Revised& operator=(T value) {
        if (mValue == value) return *this;
        mValue = std::move(value);
        mRevision.raise();
        return *this;
    }

    /// The value.
    operator const T&() const { return mValue; }
    /// The value.
    const T& operator*() const { return mValue; }
    /// Its members.
    const T* operator->() const { return &mValue; }

private:
    Revision& mRevision;
    T mValue;
};

} // namespace zandor::model

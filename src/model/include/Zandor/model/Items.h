#pragma once

#include <Zandor/model/Revision.h>
#include <Zandor/platform/KeyedCollection.h>

namespace zandor::model {

/// What a query consists of: its tables, its joins or its definitions, which write their changes
/// into the query's log from their adding on. So does the list, when something comes or goes.
///
/// Every item is an Own, which has a Key() and a revision().
template <class Own, class Interface>
class Items final : public platform::KeyedCollection<Interface> {
    using Base = platform::KeyedCollection<Interface>;

public:
    /// `log` is that of the query.
    explicit Items(std::shared_ptr<ChangeLog> log) : mLog(std::move(log)) { mRevision.enter(mLog); }

    /// Error 457 when an item has the same key; nothing is added then.
    void Add(const platform::Ref<Own>& item) { Insert(this->Count() + 1, item); }
    /// As KeyedCollection::Insert.
    void Insert(std::int32_t position, const platform::Ref<Own>& item) {
        Base::Insert(position, item, item->Key());
        item->revision().enter(mLog);
        mRevision.raise();
    }
    /// Error 5 when no item has the key; nothing changes then.
    void Remove(const platform::String& key) override {
        Base::Remove(key);
        mRevision.raise();
    }

    /// Error 5 for an item that is not in the list.
    std::int32_t positionOf(const Own& item) const {
        for (std::int32_t position = 1; position <= this->Count(); ++position)
            if (this->Item(position).get() == &item) return position;
        throw platform::errors::invalidProcedureCall();
    }
    /// The item at one position then has another; both are from 1 to Count.
    void Move(std::int32_t from, std::int32_t to) {
        if (from == to) return;
        const auto item = this->Item(from);
        Base::Remove(item->Key());
        Base::Insert(to, item, item->Key());
        mRevision.raise();
    }

    /// Item by its own type; error 9 outside 1 to Count.
    platform::Ref<Own> own(std::int32_t position) const {
        return std::static_pointer_cast<Own>(this->Item(position));
    }
    /// Of which items there are, and in which order.
    const Revision& revision() const { return mRevision; }

private:
    const std::shared_ptr<ChangeLog> mLog;
    Revision mRevision;
};

} // namespace zandor::model

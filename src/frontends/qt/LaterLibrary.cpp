#include "frontends/qt/LaterLibrary.h"

#include <Zandor/platform/RuntimeError.h>

namespace zandor::platform::qt {

namespace {

template <class T>
class NoItems final : public TalvikZandorLib::EditableCollection<T> {
public:
    std::int32_t Count() const override { return 0; }
    Ref<T> Item(std::int32_t) const override { throw errors::subscriptOutOfRange(); }
    Ref<T> Item(const String&) const override { throw errors::invalidProcedureCall(); }
    void Remove(const String&) override { throw errors::invalidProcedureCall(); }
};

/// Nothing fits into it: joins and definitions are between columns of its tables.
class EmptyQuery final : public TalvikZandorLib::Zandor {
public:
    TalvikZandorLib::Collection<TalvikZandorLib::ZDTable>& Tables() override { return mTables; }
    TalvikZandorLib::EditableCollection<TalvikZandorLib::ZDJoin>& Joins() override {
        return mJoins;
    }
    TalvikZandorLib::EditableCollection<TalvikZandorLib::ZDColumnDefinition>&
    ColumnDefinitions() override {
        return mDefinitions;
    }
    Ref<TalvikZandorLib::ZDJoin> AddJoin(const Ref<TalvikZandorLib::ZDJoin>&) override {
        throw errors::invalidProcedureCall();
    }
    Ref<TalvikZandorLib::ZDColumnDefinition>
    AddColumnDefinition(const Ref<TalvikZandorLib::ZDColumnDefinition>&) override {
        throw errors::invalidProcedureCall();
    }
    void DeleteTable(const Ref<TalvikZandorLib::ZDTable>&) override {
        throw errors::invalidProcedureCall();
    }

private:
    NoItems<TalvikZandorLib::ZDTable> mTables;
    NoItems<TalvikZandorLib::ZDJoin> mJoins;
    NoItems<TalvikZandorLib::ZDColumnDefinition> mDefinitions;
};

} // namespace

Ref<TalvikZandorLib::Zandor> LaterLibrary::NewZandor() {
    if (!mLibrary) return makeRef<EmptyQuery>();
    return mLibrary->NewZandor();
}

Ref<TalvikZandorLib::ZDJoin> LaterLibrary::NewZDJoin() { return given().NewZDJoin(); }

Ref<TalvikZandorLib::ZDColumnDefinition> LaterLibrary::NewZDColumnDefinition() {
    return given().NewZDColumnDefinition();
}

TalvikZandorLib::Library& LaterLibrary::given() const {
    if (!mLibrary)
        throw RuntimeError{errors::objectNotSet().Number,
                           u"The widget has no library yet: call setLibrary before setModel."};
    return *mLibrary;
}

} // namespace zandor::platform::qt

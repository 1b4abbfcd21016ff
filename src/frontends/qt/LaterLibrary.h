#pragma once

#include <Zandor/TalvikZandorLib.h>

namespace zandor::platform::qt {

/// Hands on to a library that may be given later than the control is made, as for a widget that
/// comes from a form. Until then there are models without anything in them, and nothing else.
class LaterLibrary final : public TalvikZandorLib::Library {
public:
    void set(TalvikZandorLib::Library& library) { mLibrary = &library; }

    Ref<TalvikZandorLib::Zandor> NewZandor() override;
    /// Error 91 while there is no library.
    Ref<TalvikZandorLib::ZDJoin> NewZDJoin() override;
    Ref<TalvikZandorLib::ZDColumnDefinition> NewZDColumnDefinition() override;

private:
    TalvikZandorLib::Library& given() const;

    TalvikZandorLib::Library* mLibrary = nullptr;
};

} // namespace zandor::platform::qt

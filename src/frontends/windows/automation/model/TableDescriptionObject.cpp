#include "frontends/windows/automation/model/TableDescriptionObject.h"

#include "frontends/windows/automation/com/Value.h"
#include "frontends/windows/automation/model/members.h"

namespace zandor::automation {

STDMETHODIMP TableDescriptionObject::get_Name(BSTR* value) {
    return answer([&] { give(value, object()->name); });
}

STDMETHODIMP TableDescriptionObject::put_Name(BSTR value) {
    return answer([&] { object()->name = textOf(value); });
}

STDMETHODIMP TableDescriptionObject::get_Schema(BSTR* value) {
    return answer([&] { give(value, object()->schema); });
}

STDMETHODIMP TableDescriptionObject::put_Schema(BSTR value) {
    return answer([&] { object()->schema = textOf(value); });
}

STDMETHODIMP TableDescriptionObject::AddColumn(BSTR Name, ZDColumnType Type,
                                               VARIANT_BOOL PrimaryKey, VARIANT DeclaredType) {
    return answer([&] {
        if (Type < zdUnknown || Type > zdBlob) throw platform::errors::invalidProcedureCall();
        object()->columns.push_back(
            {textOf(Name), static_cast<model::ColumnType>(Type),
             isMissing(DeclaredType) ? platform::String() : stringOf(DeclaredType),
             PrimaryKey != VARIANT_FALSE});
    });
}

} // namespace zandor::automation

#include "PythonQuestions.h"

#include "adapters.h"
#include "records.h"

namespace zandor::python {

using TalvikDBxZandor::HostEntry;
using TalvikDBxZandor::JoinEnd;
using TalvikDBxZandor::MenuPlace;

template <class... Abouts>
bool PythonQuestions::answer(const char* name, const Abouts&... abouts) const {
    const Gil gil;
    const Object said = call<Object>(name, abouts...);
    if (said.get() == Py_None)
        throwTypeError("%s must be True or False, not NoneType", nameOf(name).c_str());
    return asFlag(said.get());
}

bool PythonQuestions::MayJoin(const JoinEnd& left, const JoinEnd& right) {
    const Gil gil;
    return answer("MayJoin", toPython(left), toPython(right));
}

bool PythonQuestions::MayRemoveJoin(const Ref<TalvikZandorLib::ZDJoin>& join) {
    return answer("MayRemoveJoin", join);
}

bool PythonQuestions::MayCloseTable(const Ref<TalvikZandorLib::ZDTable>& table) {
    return answer("MayCloseTable", table);
}

bool PythonQuestions::MayComeOut(const Ref<TalvikZandorLib::ZDColumn>& column) {
    return answer("MayComeOut", column);
}

bool PythonQuestions::MayRemoveColumn(const Ref<TalvikZandorLib::ZDColumnDefinition>& definition) {
    return answer("MayRemoveColumn", definition);
}

std::vector<HostEntry> PythonQuestions::MenuEntries(const MenuPlace& place) {
    const Gil gil;
    const auto offered = offeredEntries(call<Object>("MenuEntries", toPython(place)).get());
    auto callables = std::make_shared<Callables>();
    for (const auto& entry : offered) callables->push_back(entry.chosen);
    mCallables = callables;

    std::vector<HostEntry> entries;
    for (std::size_t at = 0; at < offered.size(); ++at) {
        HostEntry& entry = entries.emplace_back();
        entry.Caption = offered[at].caption;
        entry.Enabled = offered[at].enabled;
        if (offered[at].chosen.get() == Py_None) continue;
        entry.Chosen = [at, known = std::weak_ptr<const Callables>(callables)] {
            const Gil gil;
            const auto callables = known.lock();
            if (!callables) return; // the widget asks somebody else by now
            const Object chosen = (*callables)[at];
            Object::take(PyObject_CallNoArgs(chosen.get()));
        };
    }
    return entries;
}

int PythonQuestions::visit(visitproc visit, void* argument) const {
    if (const int result = visit(object(), argument)) return result;
    if (mCallables)
        for (const Object& callable : *mCallables)
            if (const int result = visit(callable.get(), argument)) return result;
    return 0;
}

bool asksNothingOrQuestions(PyObject* object) {
    if (object == Py_None) return true;
    try {
        return isOfPackage(object, "questions", "Questions");
    } catch (const PythonError&) {
        return false; // SIP then says which argument it was
    }
}

QuestionsRef questionsOf(PyObject* object) {
    if (object == Py_None) return {};
    return kept(std::make_shared<PythonQuestions>(object));
}

} // namespace zandor::python

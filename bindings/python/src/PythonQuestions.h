#pragma once

#include "Host.h"

#include <Zandor/Questions.h>

#include <memory>
#include <vector>

namespace zandor::python {

/// The answers of an object of zandor.Questions, for one widget. Whatever it raises is thrown as a
/// PythonError; so is None for an answer, which a method that forgets to return gives.
class PythonQuestions final : public TalvikDBxZandor::Questions, public Host {
    template <class T>
    using Ref = platform::Ref<T>;

public:
    using Host::Host;

    bool MayJoin(const TalvikDBxZandor::JoinEnd& left,
                 const TalvikDBxZandor::JoinEnd& right) override;
    bool MayRemoveJoin(const Ref<TalvikZandorLib::ZDJoin>& join) override;
    bool MayCloseTable(const Ref<TalvikZandorLib::ZDTable>& table) override;
    bool MayComeOut(const Ref<TalvikZandorLib::ZDColumn>& column) override;
    bool MayRemoveColumn(const Ref<TalvikZandorLib::ZDColumnDefinition>& definition) override;
    std::vector<TalvikDBxZandor::HostEntry>
    MenuEntries(const TalvikDBxZandor::MenuPlace& place) override;

    /// Shows Python's garbage collector what this holds for its widget.
    int visit(visitproc visit, void* argument) const;

private:
    using Callables = std::vector<Object>;

    template <class... Abouts>
    bool answer(const char* name, const Abouts&... abouts) const;

    /// What the entries of the menu that was opened last call. Here, and not in the entries, so
    /// that the garbage collector sees them.
    std::shared_ptr<const Callables> mCallables;
};

/// As a widget takes them; nothing for None.
using QuestionsRef = std::shared_ptr<PythonQuestions>;

/// Whether questionsOf() takes it: None, or an object of zandor.Questions. Under the lock.
bool asksNothingOrQuestions(PyObject* object);
QuestionsRef questionsOf(PyObject* object);

} // namespace zandor::python

using zandor::python::QuestionsRef;

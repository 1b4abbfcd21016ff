#pragma once

#include <Zandor/model/Change.h>

#include <QUndoCommand>

#include <functional>

namespace zandor::designer {

/// One change of the query that can be undone and done again.
class Step final : public QUndoCommand {
public:
    using Apply = std::function<void(const model::Change&)>;

    /// Of a change that has been made already.
    Step(const QString& name, model::Change change, Apply apply);

    void undo() override;
    /// The stack calls this for a new step too, which does nothing then.
    void redo() override;

private:
    const model::Change mChange;
    const Apply mApply;
    bool mDone = true;
};

} // namespace zandor::designer

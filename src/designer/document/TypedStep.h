#pragma once

#include "designer/document/Document.h"

#include <QUndoCommand>

namespace zandor::designer {

/// What was typed was given up. It changes places with whatever is typed when the step is undone or
/// done again, so that neither is lost.
class TypedStep final : public QUndoCommand {
public:
    /// Puts a text, or none, in place of the one that is there, which it returns.
    using Exchange = std::function<Document::Typed(Document::Typed)>;

    TypedStep(const QString& name, Exchange exchange)
        : QUndoCommand(name), mExchange(std::move(exchange)) {}

    void undo() override { mOther = mExchange(std::move(mOther)); }
    void redo() override { mOther = mExchange(std::move(mOther)); }

private:
    const Exchange mExchange;
    Document::Typed mOther;
};

} // namespace zandor::designer

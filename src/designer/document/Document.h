#pragma once

#include "model/Query.h"

#include <QObject>

#include <functional>

class QUndoStack;

namespace designer {

/// The query that is being drawn, and the steps that led to it. Every change goes through here,
/// so that it can be undone.
class Document final : public QObject {
    Q_OBJECT

public:
    explicit Document(QObject* parent = nullptr);
    ~Document() override;

    /// Never nothing. The same object as long as the document is; undone and done again in place.
    const platform::Ref<model::Query>& query() const { return mQuery; }
    /// Takes another query, or an empty one, with no steps to undo. Emits outdated() and changed().
    void setQuery(const platform::Ref<model::Query>& query);

    /// The steps made so far; each has a name for the menu ("Delete table orders").
    QUndoStack& steps() { return *mSteps; }

    /// Changes the query as one step of this name. The function may do anything that Query can; what
    /// it did is found by comparing. A run-time error from it passes through, and what it had done
    /// by then stays, as a step. Emits outdated() and changed() unless nothing came of it.
    void change(const QString& name, const std::function<void(model::Query&)>& how);

    /// The control over the query has changed it already: what changed becomes a step when control
    /// returns to the event loop, so that one gesture is one step.
    void changedByControl();

signals:
    /// The query says something else than before, whoever changed it.
    void changed();
    /// The control must show the query anew, for it was not the control that changed it.
    void outdated();

private:
    platform::Ref<model::Query> mQuery;
    QUndoStack* mSteps;
};

} // namespace designer

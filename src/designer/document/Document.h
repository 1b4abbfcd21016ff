#pragma once

#include <Zandor/QueryDocument.h>
#include <Zandor/model/Snapshot.h>

#include <QObject>

#include <functional>

class QAction;
class QUndoStack;

namespace zandor::designer {

/// The query that is being drawn, and the steps that led to it. Every change goes through here,
/// so that it can be undone. What is selected in the drawing is part of no step. Beside the query
/// there may be a statement that somebody has typed and that it does not say: it is saved with the
/// query, and is no step itself.
///
/// Whoever draws need not tell of every change: one made with a mouse button or a key, on whatever
/// widget, is seen when control has returned to the event loop.
class Document final : public QObject {
    Q_OBJECT

public:
    explicit Document(QObject* parent = nullptr);
    ~Document() override;

    /// Never nothing. Until the next setQuery() the same object; undone and done again in place.
    const platform::Ref<model::Query>& query() const { return mQuery; }
    using Typed = std::optional<files::TypedStatement>;
    /// What is typed and is not drawn; nothing when the query is all that there is.
    const Typed& typed() const { return mTyped; }
    /// Emits typedChanged(), unless it is the same.
    void setTyped(Typed typed);
    /// Gives up what is typed, as a step of this name: to undo it brings it back, and no text is
    /// lost that was typed meanwhile.
    void giveUpTyped(const QString& name);

    /// Takes another query, or an empty one, and what was typed for it, with no steps to undo, as
    /// one that is saved. Emits replaced(), outdated() and changed().
    void setQuery(const platform::Ref<model::Query>& query, Typed typed = {});

    /// The steps made so far, after settle(); each has a name for the menu ("Delete table orders").
    /// Whoever keeps the stack calls settle() before it undoes anything with it.
    QUndoStack& steps();
    void undo();
    void redo();
    /// "Undo Delete table orders", enabled as long as there is something to undo; undoes it. With
    /// the platform's shortcut and no icon.
    QAction* makeUndoAction(QObject* parent);
    QAction* makeRedoAction(QObject* parent);

    /// Whether the query is another than the one last set or saved, or what is typed for it.
    bool isModified();
    /// The query of now is the saved one, or is to count as one that is saved nowhere.
    void setModified(bool modified);

    /// Changes the query as one step of this name. The function may do anything that Query can;
    /// what it did is found by comparing. A run-time error from it passes through, and what it had
    /// done by then stays, as a step. Emits outdated() and changed() unless nothing came of it.
    void change(const QString& name, const std::function<void(model::Query&)>& how);

    /// The control over the query has changed it already: what changed becomes a step when control
    /// returns to the event loop, so that one gesture is one step.
    void changedByControl();
    /// Makes what has changed a step at once. Emits changed() when there was something.
    void settle();

    bool eventFilter(QObject* watched, QEvent* event) override;

signals:
    /// It is another query: what there was to say about the one before is past.
    void replaced();
    /// The query says something else than before, whoever changed it.
    void changed();
    /// The control must show the query anew, for it was not the control that changed it.
    void outdated();
    /// typed() is another.
    void typedChanged();
    void modifiedChanged(bool modified);
    /// A gesture or a key is over, whether or not it has changed the query.
    void settled();

private:
    /// False when there was nothing. Names the step after what changed when it gets no name.
    bool record(const QString& name);
    void apply(const model::Change& change);
    bool isModifiedNow() const;
    void tellModified();

    platform::Ref<model::Query> mQuery;
    model::Snapshot mKnown; ///< the query after the last step
    QUndoStack* mSteps;
    Typed mTyped;
    Typed mSavedTyped;
    bool mToldModified = false;
    bool mSettlesLater = false;
    bool mStepped = false;      ///< a step was undone or done again, and nobody knows yet
    bool mTypedStepped = false; ///< the same of one of what is typed
};

} // namespace zandor::designer

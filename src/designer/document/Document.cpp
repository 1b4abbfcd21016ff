#include "designer/document/Document.h"

#include "designer/document/Step.h"
#include "designer/document/StepName.h"
#include "designer/document/TypedStep.h"
#include "frontends/qt/ZandorWindowMessage.h"

#include <QAction>
#include <QCoreApplication>
#include <QEvent>
#include <QKeySequence>
#include <QUndoStack>

#include <algorithm>

namespace zandor::designer {

Document::Document(QObject* parent)
    : QObject(parent), mQuery(platform::makeRef<model::Query>()), mKnown(*mQuery),
      mSteps(new QUndoStack(this)) {
    // Not from within the step, when the stack's own state is still the one before.
    connect(mSteps, &QUndoStack::indexChanged, this, [this] {
        if (std::exchange(mStepped, false)) {
            emit outdated();
            emit changed();
        }
        if (std::exchange(mTypedStepped, false)) emit typedChanged();
    });
    connect(mSteps, &QUndoStack::indexChanged, this, &Document::tellModified);
    connect(mSteps, &QUndoStack::cleanChanged, this, &Document::tellModified);
    if (auto* application = QCoreApplication::instance()) application->installEventFilter(this);
}

Document::~Document() {
    // Steps call back.
    delete mSteps;
}

void Document::setTyped(Typed typed) {
    if (mTyped == typed) return;
    mTyped = std::move(typed);
    emit typedChanged();
    tellModified();
}

void Document::giveUpTyped(const QString& name) {
    if (!mTyped) return;
    settle();
    mSteps->push(new TypedStep(name, [this](Typed typed) {
        mTypedStepped = true;
        return std::exchange(mTyped, std::move(typed));
    }));
}

void Document::setQuery(const platform::Ref<model::Query>& query, Typed typed) {
    mQuery = query;
    mKnown = model::Snapshot(*mQuery);
    mTyped = std::move(typed);
    mSavedTyped = mTyped;
    mSteps->clear();
    tellModified();
    emit replaced();
    emit outdated();
    emit changed();
}

QUndoStack& Document::steps() {
    settle();
    return *mSteps;
}

void Document::undo() { steps().undo(); }
void Document::redo() { steps().redo(); }

QAction* Document::makeUndoAction(QObject* parent) {
    QAction* action = mSteps->createUndoAction(parent, tr("&Undo"));
    action->setShortcut(QKeySequence::Undo);
    disconnect(action, &QAction::triggered, mSteps, nullptr); // which does not settle
    connect(action, &QAction::triggered, this, &Document::undo);
    return action;
}

QAction* Document::makeRedoAction(QObject* parent) {
    QAction* action = mSteps->createRedoAction(parent, tr("&Redo"));
    // A desktop knows one of them; people know the other as well.
    action->setShortcuts({Qt::CTRL | Qt::SHIFT | Qt::Key_Z, Qt::CTRL | Qt::Key_Y});
    disconnect(action, &QAction::triggered, mSteps, nullptr); // which does not settle
    connect(action, &QAction::triggered, this, &Document::redo);
    return action;
}

bool Document::isModified() {
    settle();
    return isModifiedNow();
}

/// A text that was given up is no change where none was saved.
bool Document::isModifiedNow() const {
    if (mTyped != mSavedTyped || mSteps->cleanIndex() < 0) return true;
    const auto [from, to] = std::minmax({mSteps->cleanIndex(), mSteps->index()});
    for (int step = from; step < to; ++step)
        if (!dynamic_cast<const TypedStep*>(mSteps->command(step))) return true;
    return false;
}

void Document::tellModified() {
    const bool modified = isModifiedNow();
    if (std::exchange(mToldModified, modified) != modified) emit modifiedChanged(modified);
}

void Document::setModified(bool modified) {
    settle();
    if (modified) {
        mSteps->resetClean();
    } else {
        mSavedTyped = mTyped;
        mSteps->setClean();
    }
    tellModified();
}

void Document::change(const QString& name, const std::function<void(model::Query&)>& how) {
    settle();
    const auto tell = [&] {
        if (!record(name)) return;
        emit outdated();
        emit changed();
    };
    try {
        how(*mQuery);
    } catch (...) {
        tell();
        throw;
    }
    tell();
}

void Document::changedByControl() {
    if (std::exchange(mSettlesLater, true)) return;
    QMetaObject::invokeMethod(this, &Document::settle, Qt::QueuedConnection);
}

void Document::settle() {
    mSettlesLater = false;
    if (record({})) emit changed();
    emit settled();
}

bool Document::eventFilter(QObject*, QEvent* event) {
    // The control has no event for a new size of a table, nor for a join from its menu, the end of
    // which it announces after all that was chosen is done.
    static const QEvent::Type menu =
        ZandorWindowMessage::typeOf(QStringLiteral("TALVIKDISABLEVELT"));
    const QEvent::Type type = event->type();
    if (type == QEvent::MouseButtonRelease || type == QEvent::KeyRelease || type == menu)
        changedByControl();
    return false;
}

bool Document::record(const QString& name) {
    model::Change change = mKnown.update(*mQuery);
    if (change.empty()) return false;
    const QString found = stepName(change);
    if (found.isEmpty()) {
        // Something came and went again, so that its keys are free and its names read anew.
        mQuery->apply(change.reversed());
        mKnown.update(*mQuery);
        return false;
    }
    mSteps->push(new Step(name.isEmpty() ? found : name, std::move(change),
                          [this](const model::Change& step) { apply(step); }));
    return true;
}

void Document::apply(const model::Change& change) {
    // A step starts from the state that it knows, whatever was done behind the document's back.
    const model::Change unknown = mKnown.update(*mQuery);
    if (!unknown.empty()) mQuery->apply(unknown.reversed());
    mQuery->apply(change);
    mKnown.update(*mQuery);
    mStepped = true;
}

} // namespace zandor::designer

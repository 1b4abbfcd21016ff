#include "designer/document/Document.h"

#include <QUndoStack>

namespace designer {

Document::Document(QObject* parent)
    : QObject(parent), mQuery(platform::makeRef<model::Query>()), mSteps(new QUndoStack(this)) {}

Document::~Document() = default;

void Document::setQuery(const platform::Ref<model::Query>& query) {
    mQuery = query;
    mSteps->clear();
    emit outdated();
    emit changed();
}

void Document::change(const QString&, const std::function<void(model::Query&)>& how) {
    how(*mQuery);
    emit outdated();
    emit changed();
}

void Document::changedByControl() { emit changed(); }

} // namespace designer

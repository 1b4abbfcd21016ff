#include "designer/document/Autosave.h"

#include "designer/document/Document.h"
#include "designer/document/QueryFile.h"
#include "designer/statement/ModelWords.h"

#include <QCoreApplication>

namespace zandor::designer {

Autosave::Autosave(Document& document, QueryFile& file, const QString& folder,
                   std::chrono::milliseconds delay)
    : mDocument(document), mFile(file), mFolder(folder) {
    mWriter.setMaxThreadCount(1);
    mTimer.setSingleShot(true);
    mTimer.setInterval(delay);
    connect(&mTimer, &QTimer::timeout, this, &Autosave::save);
    connect(&document, &Document::changed, this, &Autosave::documentChanged);
    connect(&document, &Document::typedChanged, this, &Autosave::documentChanged);
    connect(&document, &Document::modifiedChanged, this, &Autosave::documentChanged);
    connect(&document, &Document::settled, this, [this] {
        if (mTyping && !mTimer.isActive()) mTimer.start();
    });
}

Autosave::~Autosave() { remove(); }

void Autosave::adopt(AutosaveSlot::Ptr slot) {
    remove();
    mSlot = std::move(slot);
}

void Autosave::documentChanged() {
    if (!mDocument.isModified())
        remove();
    else if (!mTimer.isActive()) // not anew with every change, or a busy user is never saved
        mTimer.start();
}

std::optional<QString> Autosave::saveAtOnce() {
    mTimer.stop();
    save();
    mWriter.waitForDone();
    QCoreApplication::sendPostedEvents(this, QEvent::MetaCall); // how it went
    return mFailure;
}

/// What is to be kept; nothing when all of it is in the query's file.
std::optional<files::QueryDocument> Autosave::wanted() const {
    files::QueryDocument content = mFile.content();
    if (mTyping) {
        const auto copy = model::Query::restored(content.query->record());
        if (mTyping(copy)) {
            content.query = copy;
            return content;
        }
    }
    if (!mDocument.isModified()) return {};
    return content;
}

void Autosave::save() {
    const auto content = wanted();
    if (!content) return remove();
    if (!mSlot) {
        auto made = AutosaveSlot::made(mFolder);
        if (!made) return tell(inWords(made.failure()));
        mSlot = std::move(*made);
    }
    const auto bytes = Autosaved{mFile.path(), *content, mFile.origin()}.bytes();
    if (!bytes) return tell(inWords(bytes.failure()));
    mWriter.start([this, file = mSlot->file(), content = *bytes] {
        const auto error = AutosaveSlot::write(file, content);
        QMetaObject::invokeMethod(this, [this, error] {
            if (error) return tell(*error);
            works();
        });
    });
}

void Autosave::remove() {
    mTimer.stop();
    mWriter.waitForDone();
    if (mSlot) mSlot->remove();
    works();
}

void Autosave::works() {
    if (std::exchange(mFailure, std::nullopt)) emit worked();
}

void Autosave::tell(const QString& reason) {
    mFailure = tr("The changes cannot be kept safe in \"%1\" (%2); save the query yourself.")
                   .arg(mFolder, reason);
    emit failed(*mFailure);
    if (mDocument.isModified()) mTimer.start(); // there may be room again
}

} // namespace zandor::designer

#pragma once

#include "designer/document/AutosaveSlot.h"

#include <QObject>
#include <QThreadPool>
#include <QTimer>

#include <chrono>
#include <functional>

namespace zandor::designer {

class Document;
class QueryFile;

/// Keeps the document's query in an autosave file as long as it is modified: written soon after a
/// change, deleted when the query is saved, given up, or the object goes. What is there after the
/// process was killed is offered by Recovery.
class Autosave final : public QObject {
    Q_OBJECT

public:
    static constexpr std::chrono::milliseconds usualDelay = std::chrono::seconds(3);

    Autosave(Document& document, QueryFile& file, const QString& folder,
             std::chrono::milliseconds delay = usualDelay);
    ~Autosave() override;

    /// Goes on with the file of one that was killed, whose query the document has now.
    void adopt(AutosaveSlot::Ptr slot);
    /// Writes what is being typed, and in the query not yet, into a copy of it; false when nothing
    /// is.
    using Typing = std::function<bool(const platform::Ref<model::Query>& copy)>;
    /// From now on that is kept too.
    void setTyping(Typing typing) { mTyping = std::move(typing); }
    /// For a process that is ended from outside: writes what is modified and waits until it is on
    /// the disk. What went wrong, or nothing.
    std::optional<QString> saveAtOnce();

signals:
    /// It could not be written: one line. Told each time; it is tried again and again.
    void failed(const QString& message);
    /// What failed works again, or there is nothing to keep any more.
    void worked();

private:
    void documentChanged();
    std::optional<files::QueryDocument> wanted() const;
    void save();
    void remove();
    void tell(const QString& reason);
    void works();

    Document& mDocument;
    QueryFile& mFile;
    const QString mFolder;
    Typing mTyping;
    AutosaveSlot::Ptr mSlot; ///< made when it is needed first
    QTimer mTimer;
    QThreadPool mWriter; ///< one thread, so that files are written in their order
    std::optional<QString> mFailure;
};

} // namespace zandor::designer

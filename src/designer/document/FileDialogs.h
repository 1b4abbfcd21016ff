#pragma once

#include <QObject>

class QWidget;

namespace zandor::designer {

class Document;
class QueryFile;
class RecentFiles;

/// New, open and save as a user asks for them: with the dialogs, the questions and the errors, on a
/// window, which also gets its mark for a modified query (its title needs "[*]"). Each returns
/// whether it was done; not when the user cancelled or it failed, which was told then.
class FileDialogs final : public QObject {
    Q_OBJECT

public:
    FileDialogs(Document& document, QueryFile& file, RecentFiles& recent, QWidget& window);

    bool startNew();
    /// Asks for a file.
    bool open();
    bool open(const QString& path);
    /// Asks for a query file for whatever the title says; empty: the user took none.
    QString ask(const QString& title);
    /// Asks for a file when there is none yet.
    bool save();
    bool saveAs();
    /// Looks whether another program has changed the file, and asks whose state is to stay. To be
    /// called when the user comes back to the window.
    void lookAtFile();
    /// Whether the query may be given up: it is saved, the user saves it now, or discards it. To be
    /// asked before it is replaced by something else than these commands and before the window
    /// closes.
    bool mayLose();

signals:
    /// A file was opened: its database may be another one (QueryFile::databaseAddress()).
    void opened();
    void saved();
    /// The query's file is no longer there: one line.
    void gone(const QString& message);

private:
    enum class Whose { theirs, mine, elsewhere, open };
    Whose ask(const QString& detail, const QString& mine, const QString& open);
    bool openFrom(const QString& path);
    bool saveTo(const QString& path);
    void tell(const QString& title, const QString& error);

    Document& mDocument;
    QueryFile& mFile;
    RecentFiles& mRecent;
    QWidget& mWindow;
    bool mAsking = false;
};

} // namespace zandor::designer

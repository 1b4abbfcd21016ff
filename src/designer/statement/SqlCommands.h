#pragma once

#include <QAction>
#include <QObject>

class QMimeData;
class QWidget;

namespace zandor::designer {

class Database;
class Document;
class FileDialogs;
class QueryFile;
class StatementPanel;
class TableAdding;

/// Statements that people have already: opened from files, pasted, and saved as text.
class SqlCommands final : public QObject {
    Q_OBJECT

public:
    /// What the commands work on; all of it outlives them.
    struct Parts {
        Document& document;
        Database& database;
        QueryFile& file;
        FileDialogs& files;
        TableAdding& adding;
        StatementPanel& panel;
        QWidget& drawing;
    };
    /// `window` is the parent of the dialogs, and of this object.
    SqlCommands(const Parts& parts, QWidget& window);

    /// Asks for a file; see openFrom().
    QAction openFile;
    /// The text of the clipboard becomes the drawing, as one step.
    QAction paste;
    /// Writes the text of the panel, drawn or not, to a file that is asked for.
    QAction saveAs;

    /// The file's statement becomes a query of its own, which is saved nowhere yet. One that cannot
    /// be drawn stands in the panel then, and the drawing is as it was.
    void openFrom(const QString& path);

signals:
    /// The panel has a text that is not drawn, and should be seen.
    void refused();

private:
    void askForFile();
    void pasteText();
    void save();
    bool readTablesOf(const QString& text);
    void tell(const QString& title);

    Parts mParts;
    QWidget& mWindow;
};

/// The one file with a statement that is dropped, or nothing.
std::optional<QString> droppedStatement(const QMimeData& data);

/// Whether a text looks like a statement that could be drawn.
bool looksLikeStatement(const QString& text);

} // namespace zandor::designer

#pragma once

#include <QAction>
#include <QObject>
#include <QStringList>

namespace zandor::designer {

class Document;
class FileDialogs;
class QueryFile;
class TableAdding;

/// Saved queries as tables of the query that is drawn, and what their files say by now.
class SavedQueryCommands final : public QObject {
    Q_OBJECT

public:
    SavedQueryCommands(Document& document, const QueryFile& file, FileDialogs& dialogs,
                       TableAdding& adding, QObject* parent);

    QAction addQuery;  ///< asks for the file
    QAction readAgain; ///< all of them; enabled as long as there are any

    /// As one step, unless the file is refused.
    void add(const QString& path);
    /// As one step, if there is something new in the files. Says what is lost, and no more.
    void followFiles();

signals:
    /// A line on what was read again, and on each that could not be.
    void noted(const QString& what);
    /// Nothing was added; one line says why.
    void refused(const QString& why);

private:
    struct Outcome {
        QStringList changed;
        QStringList kept;
    };
    Outcome read();
    void offer();

    Document& mDocument;
    const QueryFile& mFile;
    TableAdding& mAdding;
};

} // namespace zandor::designer

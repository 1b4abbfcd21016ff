#pragma once

#include <QAction>
#include <QObject>

class QSettings;
class QWidget;

namespace zandor::designer {

class Document;
class DrawingArea;
class DrawingPicture;
class QueryFile;

/// The commands that take the drawing out of the window: to a file, a printer, the clipboard.
class ShowCommands final : public QObject {
    Q_OBJECT

public:
    /// `window` is the parent of the dialogs, and of this object. The settings keep the choice of
    /// `allColumns`.
    ShowCommands(Document& document, const QueryFile& file, const DrawingArea& area,
                 QSettings& settings, QWidget& window);

    QAction exportPicture;
    QAction print;
    QAction copyPicture;
    QAction allColumns; ///< whether pictures have them, however high a table is drawn

private:
    void askForFile();
    void askForPrinter();
    void copy();
    DrawingPicture picture() const;
    void follow();
    QString proposedName() const;

    Document& mDocument;
    const QueryFile& mFile;
    const DrawingArea& mArea;
    QWidget& mWindow;
};

} // namespace zandor::designer

#pragma once

#include <QAction>
#include <QObject>

class QWidget;

namespace designer {

class Document;
class DrawingArea;
class DrawingPicture;

/// The commands that take the drawing out of the window: to a file, a printer, the clipboard.
class ShowCommands final : public QObject {
    Q_OBJECT

public:
    /// `window` is the parent of the dialogs, and of this object.
    ShowCommands(Document& document, const DrawingArea& area, QWidget& window);

    QAction exportPicture;
    QAction print;
    QAction copyPicture;

private:
    void askForFile();
    void askForPrinter();
    void copy();
    DrawingPicture picture() const;
    void follow();

    Document& mDocument;
    const DrawingArea& mArea;
    QWidget& mWindow;
};

} // namespace designer

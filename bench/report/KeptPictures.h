#pragma once

#include "Drawing.h"

#include <QImage>
#include <QPixmap>

namespace report {

/// The canvas of a drawing by bare painter calls: each table from a kept picture of it, lines and
/// marks as they are. The same pixels as the drawing's own, or the program ends.
class KeptPictures {
public:
    explicit KeptPictures(Drawing& drawing);

    /// Paints the whole canvas with the first table moved by some pixels.
    void paint(QPoint moved);

private:
    struct Table {
        QPixmap picture;
        QPoint place;
    };

    QImage mSurface;
    std::vector<Table> mTables;
    std::vector<QLineF> mLines;
    std::vector<QRect> mMarks;
    QColor mWindow, mOutline, mBase;
};

} // namespace report

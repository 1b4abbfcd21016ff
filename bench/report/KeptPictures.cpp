#include "KeptPictures.h"

#include "frontends/qt/Canvas.h"
#include "frontends/qt/CanvasItems.h"
#include "frontends/qt/TabuletWidget.h"
#include "frontends/qt/mixed.h"

#include <QPainter>

#include <cmath>

namespace report {

namespace qt = zandor::platform::qt;

KeptPictures::KeptPictures(Drawing& drawing) {
    qt::Canvas& canvas = drawing.canvas();
    constexpr float twips = 15; // divided in singles, as there
    for (const auto* item : canvas.items()) {
        if (!item->visible()) continue;
        if (const auto* line = dynamic_cast<const qt::CanvasLine*>(item))
            mLines.emplace_back(line->X1() / twips, line->Y1() / twips, line->X2() / twips,
                                line->Y2() / twips);
        if (const auto* mark = dynamic_cast<const qt::CanvasShape*>(item)) {
            const auto box = mark->bounds();
            const auto whole = [](float side) {
                return static_cast<int>(std::round(side / twips));
            };
            mMarks.push_back(
                QRect(QPoint(whole(box.Left), whole(box.Top)),
                      QPoint(whole(box.Left + box.Width) - 1, whole(box.Top + box.Height) - 1)));
        }
    }
    // In the order that they lie in.
    for (QObject* child : canvas.children())
        if (auto* table = qobject_cast<qt::TabuletWidget*>(child); table && !table->isHidden())
            mTables.push_back({table->grab(), table->pos()});
    const QPalette palette = canvas.palette();
    mWindow = palette.color(QPalette::Window);
    mOutline = qt::mixed(mWindow, palette.color(QPalette::WindowText), 0.6);
    mBase = palette.color(QPalette::Base);

    const QRect seen(QPoint(), Setting::window);
    mSurface = QImage(Setting::window, QImage::Format_RGB32);
    paint({});
    const QImage shown = canvas.grab(seen).toImage().convertToFormat(QImage::Format_RGB32);
    if (shown != mSurface) {
        shown.save(QStringLiteral("report-shown.png"));
        mSurface.save(QStringLiteral("report-kept.png"));
        qFatal("the kept pictures make another picture: see report-shown.png, report-kept.png");
    }
}

void KeptPictures::paint(QPoint moved) {
    QPainter painter(&mSurface);
    painter.fillRect(mSurface.rect(), mWindow);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(QPen(mOutline, 1.2, Qt::SolidLine, Qt::FlatCap));
    for (const QLineF& line : mLines) painter.drawLine(line);
    for (const QRect& mark : mMarks) {
        painter.fillRect(mark, mOutline);
        painter.fillRect(mark.adjusted(1, 1, -1, -1), mBase);
    }
    for (const Table& table : mTables)
        painter.drawPixmap(&table == mTables.data() ? table.place + moved : table.place,
                           table.picture);
}

} // namespace report

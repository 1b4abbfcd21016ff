#include "designer/show/savePicture.h"

#include "designer/document/paths.h"
#include "designer/show/Picture.h"
#include "designer/statement/ModelWords.h"
#include "designer/tr.h"

#include <Zandor/files/Replacement.h>

#include <QBuffer>
#include <QFileInfo>
#include <QImage>
#include <QPageSize>
#include <QPainter>
#include <QPdfWriter>
#include <QPrinter>

namespace zandor::designer {

namespace {

constexpr qreal pngScale = 2;
constexpr qreal pointsPerPixel = 72.0 / Picture::pixelsPerInch;

bool writePng(const Picture& picture, QIODevice& file) {
    return picture.image(pngScale).save(&file, "PNG");
}

bool writeSvg(const Picture& picture, QIODevice& file) { return file.write(picture.svg()) > 0; }

bool writePdf(const Picture& picture, QIODevice& file) {
    QPdfWriter writer(&file);
    writer.setResolution(Picture::pixelsPerInch);
    writer.setPageSize(QPageSize(QSizeF(picture.size()) * pointsPerPixel, QPageSize::Point, {},
                                 QPageSize::ExactMatch));
    writer.setPageMargins({});
    QPainter painter;
    if (!painter.begin(&writer)) return false;
    picture.paint(painter, QRectF(0, 0, writer.width(), writer.height()));
    return painter.end();
}

} // namespace

std::optional<QString> savePicture(const Picture& picture, const QString& path) {
    if (picture.isEmpty()) return tr("There is nothing to draw; add a table first.");
    const QString suffix = QFileInfo(path).suffix().toLower();
    using Write = bool (*)(const Picture&, QIODevice&);
    const Write write = suffix == QLatin1String("png")   ? writePng
                        : suffix == QLatin1String("svg") ? writeSvg
                        : suffix == QLatin1String("pdf") ? writePdf
                                                         : nullptr;
    if (!write) return tr("A picture ends in .png, .svg or .pdf; \"%1\" does not.").arg(path);

    // In memory first: not every writer says when its file runs out of room.
    QBuffer content;
    content.open(QIODevice::WriteOnly);
    const bool drawn = write(picture, content);
    content.close();
    if (!drawn)
        return tr("The drawing is too large for \"%1\"; choose a name that ends in .svg.")
            .arg(path);
    return inWords(files::replaceFile(pathOf(path), content.data().toStdString()));
}

std::optional<QString> printPicture(const Picture& picture, QPrinter& printer) {
    if (picture.isEmpty()) return tr("There is nothing to draw; add a table first.");
    QPainter painter;
    if (!painter.begin(&printer)) return tr("The printer cannot be reached; choose another one.");
    const QRectF page(0, 0, printer.width(), printer.height());
    const QSizeF natural = QSizeF(picture.size()) * printer.resolution() / Picture::pixelsPerInch;
    // At the top, where a reader begins.
    const QSizeF fitted = natural.width() > page.width() || natural.height() > page.height()
                              ? natural.scaled(page.size(), Qt::KeepAspectRatio)
                              : natural;
    picture.paint(painter, QRectF({(page.width() - fitted.width()) / 2, 0}, fitted));
    if (!painter.end()) return tr("The page could not be printed; see the printer's own messages.");
    return {};
}

} // namespace zandor::designer

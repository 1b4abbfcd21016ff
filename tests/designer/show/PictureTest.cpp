#include "Databases.h"

#include "designer/show/DrawingPicture.h"
#include "designer/show/savePicture.h"

#include <gmock/gmock.h>

#include <QFile>
#include <QImage>
#include <QPainter>
#include <QPrinter>
#include <QSvgRenderer>

using testing::HasSubstr;

namespace {

class APicture : public testing::Test {
protected:
    QByteArray saved(const designer::DrawingPicture& picture, const QString& name) {
        const auto error = designer::savePicture(picture, folder.path(name));
        EXPECT_EQ(error.value_or(QString()), QString());
        QFile file(folder.path(name));
        EXPECT_TRUE(file.open(QIODevice::ReadOnly));
        return file.readAll();
    }

    DatabaseFolder folder;
    const designer::OpenedQuery opened = openedSample();
};

/// Whether a picture has another colour than its corner's in a rectangle.
bool isDrawn(const QImage& image, const QRect& in) {
    for (int y = in.top(); y <= in.bottom(); ++y)
        for (int x = in.left(); x <= in.right(); ++x)
            if (image.pixel(x, y) != image.pixel(0, 0)) return true;
    return false;
}

} // namespace

TEST_F(APicture, HoldsEveryTableOfTheQueryWithAMargin) {
    const designer::DrawingPicture picture(*opened.query);
    const QImage image = picture.image(1);
    EXPECT_EQ(image.size(), picture.size());
    for (const auto& table :
         platform::Each<TalvikZandorLib::ZDTable>(opened.query->Tables())) {
        const QRect box(table->Left() / 15, table->Top() / 15, table->Width() / 15,
                        table->Height() / 15);
        EXPECT_TRUE(image.rect().contains(box.adjusted(-5, -5, 5, 5)));
        EXPECT_TRUE(isDrawn(image, box));
    }
    // Neither scroll bars nor a home button.
    EXPECT_FALSE(isDrawn(image, QRect(image.width() - 15, 0, 15, image.height())));
    EXPECT_FALSE(isDrawn(image, QRect(0, image.height() - 15, image.width(), 15)));
}

TEST_F(APicture, DrawsTheJoinsBetweenTheTables) {
    const QImage with = designer::DrawingPicture(*opened.query).image(1);
    const auto without = model::Query::restored(opened.query->record());
    while (without->Joins().Count() > 0) without->Joins().Remove(without->Joins().Item(1)->Key());
    EXPECT_NE(with, designer::DrawingPicture(*without).image(1));
}

TEST_F(APicture, IsOfTheWholeDrawingHoweverFarATableStands) {
    const auto table = opened.query->tableNamed(u"categories");
    table->Left(25000);
    table->Top(20000);
    const designer::DrawingPicture picture(*opened.query);
    EXPECT_GT(picture.size().width(), 25000 / 15);
    EXPECT_TRUE(isDrawn(picture.image(1), QRect(25000 / 15, 20000 / 15, 50, 50)));
}

TEST_F(APicture, LeavesTheQueryAsItIs) {
    const auto before = opened.query->record();
    const designer::DrawingPicture picture(*opened.query);
    picture.image(1);
    EXPECT_EQ(opened.query->record(), before);
}

TEST_F(APicture, ShowsTheTextsThatTheControlIsGiven) {
    const designer::DrawingPicture picture(*opened.query, {{"DebugSwitch", 1}});
    EXPECT_FALSE(picture.image(1).isNull()); // and no trace box stood in the way
}

TEST_F(APicture, IsSavedAsPngInTwiceTheSize) {
    const designer::DrawingPicture picture(*opened.query);
    const QImage image = QImage::fromData(saved(picture, "query.png"));
    EXPECT_EQ(image.size(), picture.size() * 2);
}

TEST_F(APicture, IsSavedAsSvgWithItsTextsAsText) {
    const designer::DrawingPicture picture(*opened.query);
    const QByteArray svg = saved(picture, "query.SVG");
    EXPECT_THAT(svg.toStdString(), HasSubstr(">customers</text>"));
    EXPECT_THAT(svg.toStdString(), HasSubstr(">ordered_at</text>"));
    QSvgRenderer renderer(svg);
    ASSERT_TRUE(renderer.isValid());
    EXPECT_EQ(renderer.viewBox().size(), picture.size());
    // Read again, it is the same drawing.
    QImage image(picture.size(), QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::white);
    QPainter painter(&image);
    renderer.render(&painter);
    painter.end();
    image.save("/tmp/svg.png");
    EXPECT_TRUE(isDrawn(image, QRect(25, 25, 50, 50)));
}

TEST_F(APicture, IsSavedAsPdfOfOnePage) {
    const QByteArray pdf = saved(designer::DrawingPicture(*opened.query), "query.pdf");
    {QFile o("/tmp/q.pdf"); o.open(QIODevice::WriteOnly); o.write(pdf);}
    EXPECT_TRUE(pdf.startsWith("%PDF-"));
    EXPECT_EQ(pdf.count("/Type /Page\n"), 1);
}

TEST_F(APicture, IsPrintedOnOnePageWhateverItsSize) {
    opened.query->tableNamed(u"categories")->Left(30000);
    QPrinter printer;
    printer.setOutputFormat(QPrinter::PdfFormat);
    printer.setOutputFileName(folder.path("printed.pdf"));
    const designer::DrawingPicture picture(*opened.query);
    EXPECT_EQ(designer::printPicture(picture, printer).value_or(QString()), QString());
    QFile file(folder.path("printed.pdf"));
    ASSERT_TRUE(file.open(QIODevice::ReadOnly));
    EXPECT_EQ(file.readAll().count("/Type /Page\n"), 1);
}

TEST_F(APicture, OfAnEmptyQueryIsRefused) {
    const designer::DrawingPicture picture(*platform::makeRef<model::Query>());
    EXPECT_EQ(designer::savePicture(picture, folder.path("none.png")),
              QStringLiteral("There is nothing to draw; add a table first."));
    EXPECT_FALSE(QFile::exists(folder.path("none.png")));
}

TEST_F(APicture, OfAnotherKindIsRefused) {
    EXPECT_EQ(designer::savePicture(designer::DrawingPicture(*opened.query), "query.gif"),
              QStringLiteral("A picture ends in .png, .svg or .pdf; \"query.gif\" does not."));
}

TEST_F(APicture, ThatCannotBeWrittenIsRefusedInOneLine) {
    EXPECT_EQ(designer::savePicture(designer::DrawingPicture(*opened.query), "/no/such/a.svg"),
              QStringLiteral("The picture \"/no/such/a.svg\" cannot be written; check the folder "
                             "and your permissions."));
}

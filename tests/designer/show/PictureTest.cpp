#include "Databases.h"

#include "designer/show/DrawingPicture.h"
#include "designer/show/savePicture.h"

#include <gmock/gmock.h>

#include <QApplication>
#include <QFile>
#include <QImage>
#include <QPainter>
#include <QPrinter>
#include <QSvgRenderer>

using namespace zandor;

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
    for (const auto& table : platform::Each<TalvikZandorLib::ZDTable>(opened.query->Tables())) {
        const QRect box(table->Left() / 15, table->Top() / 15, table->Width() / 15,
                        table->Height() / 15);
        EXPECT_TRUE(image.rect().contains(box.adjusted(-5, -5, 5, 5)));
        EXPECT_TRUE(isDrawn(image, box));
    }
    // Neither scroll bars nor a home button.
    EXPECT_FALSE(isDrawn(image, QRect(image.width() - 15, 0, 15, image.height())));
    EXPECT_FALSE(isDrawn(image, QRect(0, image.height() - 15, image.width(), 15)));
}

TEST_F(APicture, HasAllColumnsOfATableUnlessItIsToBeAsDrawn) {
    const auto customers = opened.query->tableNamed(u"customers");
    const int columns = customers->Columns().Count();
    const std::string last = platform::toUtf8(customers->Columns().Item(columns)->Name());
    customers->Height(1500);
    using Rows = designer::DrawingPicture::Rows;
    const designer::DrawingPicture whole(*opened.query);
    EXPECT_THAT(whole.svg().toStdString(), HasSubstr(">" + last + "</text>"));
    const designer::DrawingPicture drawn(*opened.query, {}, Rows::asDrawn);
    EXPECT_THAT(drawn.svg().toStdString(), testing::Not(HasSubstr(">" + last + "</text>")));
    EXPECT_GT(whole.size().height(), columns * 15);
}

TEST_F(APicture, MovesDownWhatStandsBelowATableThatGrows) {
    const auto orders = opened.query->tableNamed(u"orders");
    const auto below = opened.query->tableNamed(u"categories");
    orders->Height(900);
    below->Left(static_cast<float>(orders->Left()));
    below->Top(static_cast<float>(orders->Top() + 1200));
    const designer::DrawingPicture picture(*opened.query);
    const std::string svg = picture.svg().toStdString();
    EXPECT_THAT(svg, HasSubstr(">status</text>"));    // the last of orders
    EXPECT_THAT(svg, HasSubstr(">parent_id</text>")); // of categories
    EXPECT_GT(picture.size().height(), (orders->Top() + 9 * 270 + 4 * 270) / 15);
}

TEST_F(APicture, EndsWhereTheCanvasDoesHoweverManyColumnsThereAre) {
    model::TableDescription many{.name = u"many", .columns = {}};
    for (int n = 0; n < 300; ++n) many.columns.push_back({.name = u"c" + platform::decimal(n)});
    opened.query->addTable(many);
    const auto table = opened.query->tableNamed(u"many");
    table->Left(300);
    table->Top(6000);
    table->Width(2000);
    table->Height(1500);
    const designer::DrawingPicture picture(*opened.query);
    EXPECT_GT(picture.size().height(), 2000);
    EXPECT_LE(picture.size().height(), 32767 / 15 + 25);
    EXPECT_THAT(picture.svg().toStdString(), HasSubstr(">c50</text>"));
}

TEST_F(APicture, IsDrawnForThePage) {
    const auto plain = designer::DrawingPicture(*opened.query).image(1);
    EXPECT_EQ(plain.pixelColor(0, 0), QColor(Qt::white));
    // Neither what is selected, nor the current table, nor the window's colours are in it.
    const auto orders = opened.query->tableNamed(u"orders");
    orders->Selected(1);
    orders->Columns().Item(3)->Selected(true);
    EXPECT_EQ(designer::DrawingPicture(*opened.query).image(1), plain);
    orders->Selected(0);
    opened.query->tableNamed(u"products")->Selected(1);
    EXPECT_EQ(designer::DrawingPicture(*opened.query).image(1), plain);
    for (int y = 0; y < plain.height(); ++y)
        for (int x = 0; x < plain.width(); ++x) {
            const QColor colour = plain.pixelColor(x, y);
            ASSERT_LT(colour.hsvSaturation(), 40) << x << " " << y; // black, white and grey
        }
    QApplication::setPalette(QPalette(Qt::white, Qt::black));
    const auto dark = designer::DrawingPicture(*opened.query).image(1);
    QApplication::setPalette(QPalette());
    EXPECT_EQ(dark.pixelColor(0, 0), QColor(Qt::white));
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
    EXPECT_TRUE(isDrawn(image, QRect(25, 25, 50, 50)));
}

TEST_F(APicture, IsSavedAsPdfOfOnePage) {
    const QByteArray pdf = saved(designer::DrawingPicture(*opened.query), "query.pdf");
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
              QStringLiteral("The file \"/no/such/a.svg\" cannot be saved (No such file or "
                             "directory); check the path."));
}

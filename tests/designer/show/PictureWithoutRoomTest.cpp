#include "Databases.h"
#include "support/NoRoom.h"

#include "designer/show/DrawingPicture.h"
#include "designer/show/savePicture.h"

#include <QFile>

using namespace zandor;

namespace {

class APictureFile : public WithoutRoom {
protected:
    static QByteArray contentOf(const QString& path) {
        QFile file(path);
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
    }
};

} // namespace

TEST_P(APictureFile, StaysAndTheUserIsToldWhenThereIsNoRoomForAnother) {
    const auto opened = openedSample({QStringLiteral("countries")});
    const designer::DrawingPicture picture(*opened.query);
    for (const char* suffix : {"svg", "png", "pdf"}) {
        const QString path = QString::fromStdString(folder() / ("query." + std::string(suffix)));
        ASSERT_FALSE(designer::savePicture(picture, path)) << suffix;
        const QByteArray before = contentOf(path);
        EXPECT_FALSE(before.isEmpty());
        withoutRoom([&] {
            const auto error = designer::savePicture(picture, path);
            ASSERT_TRUE(error) << suffix;
            EXPECT_TRUE(error->contains(QString::fromStdString(reason()))) << error->toStdString();
        });
        EXPECT_EQ(contentOf(path), before) << suffix;
        std::filesystem::remove(path.toStdString());
    }
}

ZANDOR_WITHOUT_ROOM(APictureFile);

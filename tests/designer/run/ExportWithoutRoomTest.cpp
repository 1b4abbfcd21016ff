#include "support/NoRoom.h"

#include "designer/run/FileExport.h"

#include <QFile>

using namespace zandor;

namespace {

constexpr int mostBytes = 20 * 1024; // more than any buffer on the way

class AnExport : public WithoutRoom {
protected:
    /// What went wrong with a file of a number of bytes: a header line and one row.
    static std::string exported(const QString& path, int bytes) {
        const int lineEnds = 2 * 2;
        designer::FileExport file(path);
        auto error = file.begin({QStringLiteral("n")});
        if (!error)
            error = file.add({{designer::Cell::Kind::text, QString(bytes - lineEnds - 1, u'x')}});
        if (!error) error = file.finish();
        return error.value_or(QString()).toStdString();
    }
    static QByteArray contentOf(const QString& path) {
        QFile file(path);
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
    }
};

} // namespace

TEST_P(AnExport, SaysThatThereIsNoRoomWhateverTheSizeAndKeepsTheFileOfBefore) {
    const QString path = QString::fromStdString(folder() / "rows.csv");
    ASSERT_EQ(exported(path, 10), "");
    const QByteArray before = contentOf(path);
    ASSERT_EQ(before.size(), 10);
    withoutRoom([&] {
        for (int bytes = 6; bytes <= mostBytes; ++bytes) {
            const std::string error = exported(path, bytes);
            ASSERT_NE(error.find(reason()), std::string::npos) << bytes << ": " << error;
            ASSERT_EQ(contentOf(path), before) << bytes;
        }
    });
    EXPECT_EQ(exported(path, mostBytes), "");
    EXPECT_EQ(contentOf(path).size(), mostBytes);
    EXPECT_EQ(std::distance(std::filesystem::directory_iterator(folder()), {}), 1);
}

ZANDOR_WITHOUT_ROOM(AnExport);

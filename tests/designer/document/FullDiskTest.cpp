#include "support/NoRoom.h"

#include "designer/document/AutosaveSlot.h"

#include <QFile>

using namespace zandor;

namespace {

constexpr int mostBytes = 20 * 1024; // more than any buffer on the way

QByteArray contentOf(const QString& path) {
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

class AnAutosaveFile : public WithoutRoom {};

} // namespace

TEST_P(AnAutosaveFile, IsKeptWhateverTheSizeOfTheOneThatHasNoRoom) {
    const QString file = QString::fromStdString(folder() / "a.autosave");
    ASSERT_FALSE(designer::AutosaveSlot::write(file, "the good copy"));
    withoutRoom([&] {
        for (int size = 1; size <= mostBytes; ++size) {
            const auto error = designer::AutosaveSlot::write(file, QByteArray(size, 'x'));
            ASSERT_TRUE(error) << size << " bytes are said to be saved";
            ASSERT_EQ(error->toStdString(), reason()) << size;
            ASSERT_EQ(contentOf(file), "the good copy") << size;
        }
    });
    EXPECT_FALSE(designer::AutosaveSlot::write(file, "the next one"));
    EXPECT_EQ(contentOf(file), "the next one");
    EXPECT_EQ(std::distance(std::filesystem::directory_iterator(folder()), {}), 1);
}

TEST_P(AnAutosaveFile, ThatNeverWasIsNotMadeAndTheReasonIsKnown) {
    withoutRoom([&] {
        const auto made = designer::AutosaveSlot::made(QString::fromStdString(folder()));
        ASSERT_FALSE(made);
        EXPECT_EQ(made.error(), reason());
    });
}

ZANDOR_WITHOUT_ROOM(AnAutosaveFile);

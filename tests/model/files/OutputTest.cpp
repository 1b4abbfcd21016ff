#include "Files.h"

#include <Zandor/files/Descriptor.h>
#include <Zandor/files/Output.h>

#include <fcntl.h>

using namespace zandor;

namespace {

/// A file that a stream writes to.
class AStream : public testing::Test {
protected:
    std::uintmax_t written() const { return std::filesystem::file_size(path); }

    const TemporaryFolder folder;
    const std::filesystem::path path = folder / "out";
    const files::Descriptor file{::open(path.c_str(), O_WRONLY | O_CREAT | O_CLOEXEC, 0600)};
};

} // namespace

TEST_F(AStream, LetsALittleWaitUntilItIsFlushed) {
    files::Stream stream(file.number(), {});
    const std::string most(64 * 1024 - 1, 'x');
    EXPECT_FALSE(stream.write(most));
    EXPECT_EQ(written(), 0U);
    EXPECT_FALSE(stream.write("y"));
    EXPECT_EQ(written(), most.size() + 1);
    EXPECT_FALSE(stream.write("z"));
    EXPECT_EQ(written(), most.size() + 1);
    EXPECT_FALSE(stream.flush());
    EXPECT_EQ(written(), most.size() + 2);
}

TEST_F(AStream, LetsNothingWaitWhereThatIsAskedFor) {
    files::Stream stream(file.number(), {}, files::Stream::nothingWaits);
    EXPECT_FALSE(stream.write("x"));
    EXPECT_EQ(written(), 1U);
}

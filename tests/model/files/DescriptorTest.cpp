#include <Zandor/files/Descriptor.h>

#include "Files.h"

#include <fcntl.h>

using namespace zandor;

namespace {

files::Descriptor opened() { return files::Descriptor(::open("/dev/null", O_RDONLY | O_CLOEXEC)); }

bool isOpen(int number) { return ::fcntl(number, F_GETFD) >= 0; }

} // namespace

TEST(ADescriptor, IsClosedOnceAndThenHasNoFile) {
    files::Descriptor file = opened();
    const int number = file.number();
    ASSERT_TRUE(isOpen(number));
    EXPECT_TRUE(file.close());
    EXPECT_FALSE(file.isOpen());
    EXPECT_FALSE(isOpen(number));
    EXPECT_TRUE(file.close()) << "there is nothing to complain about any more";
}

TEST(ADescriptor, DoesNotCloseAFileThatGotItsNumberMeanwhile) {
    auto file = std::make_optional(opened());
    const int number = file->number();
    file->close();
    const files::Descriptor other = opened();
    ASSERT_EQ(other.number(), number);
    file.reset();
    EXPECT_TRUE(isOpen(other.number()));
}

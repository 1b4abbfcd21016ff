#include "Files.h"

#include "model/SmallQuery.h"
#include "support/NoRoom.h"

#include <Zandor/files/Descriptor.h>

#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

using namespace zandor;

namespace {

namespace fs = std::filesystem;

std::string errorOfSaving(const fs::path& path, const files::QueryDocument& document) {
    const auto error = files::saveQuery(path, document);
    return error ? error->text() : std::string();
}

class AQuerysFile : public WithoutRoom {};

/// What something says when it is done by a user with no rights but those of everybody.
std::string withoutRights(const std::function<std::string()>& run) {
    int ends[2] = {};
    EXPECT_EQ(::pipe(ends), 0);
    const pid_t child = ::fork();
    if (child == 0) {
        constexpr uid_t nobody = 65534;
        const bool done = ::geteuid() != 0 || ::setuid(nobody) == 0;
        const std::string said = done ? run() : "no other user";
        files::writeAll(ends[1], said);
        ::_exit(0);
    }
    ::close(ends[1]);
    std::string said(1000, ' ');
    said.resize(static_cast<std::size_t>(std::max<ssize_t>(::read(ends[0], said.data(), 1000), 0)));
    ::close(ends[0]);
    ::waitpid(child, nullptr, 0);
    return said;
}

} // namespace

TEST_P(AQuerysFile, StaysWhenThereIsNoRoomForAnother) {
    SmallQuery small;
    const fs::path path = folder() / "a.json";
    ASSERT_EQ(errorOfSaving(path, small.query), "");
    const std::string before = contentOf(path);
    withoutRoom([&] {
        for (int tables = 0; tables < 12; ++tables) {
            small.query->addTable(SmallQuery::described(u"table" + platform::decimal(tables)));
            ASSERT_NE(errorOfSaving(path, small.query).find(reason()), std::string::npos);
            ASSERT_EQ(contentOf(path), before);
        }
    });
    EXPECT_EQ(errorOfSaving(path, small.query), "");
    EXPECT_TRUE(files::loadQuery(path));
}

ZANDOR_WITHOUT_ROOM(AQuerysFile);

TEST(SavingAQuery, WritesAFileThatLoads) {
    const TemporaryFolder folder;
    SmallQuery small;
    ASSERT_EQ(errorOfSaving(folder / "a.json", small.query), "");
    const auto loaded = files::loadQuery(folder / "a.json");
    ASSERT_TRUE(loaded) << loaded.error();
    EXPECT_EQ(loaded->query->record(), small.query->record());
    EXPECT_EQ(folder.names(), std::vector<std::string>{"a.json"});
}

TEST(SavingAQuery, LeavesTheOldFileWholeAndNoOtherWhenTheDiskIsFull) {
    const TemporaryFolder folder;
    SmallQuery small;
    ASSERT_EQ(errorOfSaving(folder / "a.json", small.query), "");
    const std::string before = contentOf(folder / "a.json");
    small.query->addTable(SmallQuery::described(u"third"));
    {
        const LittleRoom little(before.size() / 2);
        EXPECT_EQ(errorOfSaving(folder / "a.json", small.query),
                  "The file \"" + (folder / "a.json").string() +
                      "\" cannot be saved (File too large); choose another disk.");
        EXPECT_NE(errorOfSaving(folder / "new.json", small.query), "");
    }
    EXPECT_EQ(contentOf(folder / "a.json"), before);
    EXPECT_EQ(folder.names(), std::vector<std::string>{"a.json"});
    EXPECT_EQ(errorOfSaving(folder / "a.json", small.query), "");
    EXPECT_NE(contentOf(folder / "a.json"), before);
}

TEST(SavingAQuery, LeavesTheOldFileWhenTheQueryCannotBeWritten) {
    const TemporaryFolder folder;
    SmallQuery small;
    ASSERT_EQ(errorOfSaving(folder / "a.json", small.query), "");
    const std::string before = contentOf(folder / "a.json");
    small.query->renameTable(small.orders, u"\xDC00");
    EXPECT_NE(errorOfSaving(folder / "a.json", small.query), "");
    EXPECT_EQ(contentOf(folder / "a.json"), before);
    EXPECT_EQ(folder.names(), std::vector<std::string>{"a.json"});
}

TEST(SavingAQuery, KeepsThePermissionsOfTheFile) {
    const TemporaryFolder folder;
    SmallQuery small;
    ASSERT_EQ(errorOfSaving(folder / "a.json", small.query), "");
    ASSERT_EQ(::chmod((folder / "a.json").c_str(), 0640), 0);
    ASSERT_EQ(errorOfSaving(folder / "a.json", small.query), "");
    EXPECT_EQ(fs::status(folder / "a.json").permissions(), fs::perms(0640));
}

TEST(SavingAQuery, LeavesAFileThatIsProtected) {
    const TemporaryFolder folder;
    SmallQuery small;
    const fs::path path = folder / "a.json";
    ASSERT_EQ(errorOfSaving(path, small.query), "");
    const std::string before = contentOf(path);
    ASSERT_EQ(::chmod((folder / "").c_str(), 0777), 0); // in which anybody may replace one
    ASSERT_EQ(::chmod(path.c_str(), 0444), 0);
    small.query->addTable(SmallQuery::described(u"third"));
    EXPECT_EQ(withoutRights([&] { return errorOfSaving(path, small.query); }),
              "The file \"" + path.string() + "\" is write-protected; save under another name.");
    EXPECT_EQ(contentOf(path), before);
}

TEST(SavingAQuery, ThroughALinkReplacesTheFileAndNotTheLink) {
    const TemporaryFolder folder;
    SmallQuery small;
    ASSERT_EQ(errorOfSaving(folder / "real.json", small.query), "");
    fs::create_symlink("real.json", folder / "link.json");
    small.query->addTable(SmallQuery::described(u"third"));
    ASSERT_EQ(errorOfSaving(folder / "link.json", small.query), "");
    EXPECT_TRUE(fs::is_symlink(folder / "link.json"));
    const auto real = files::loadQuery(folder / "real.json");
    ASSERT_TRUE(real) << real.error();
    EXPECT_EQ(real->query->Tables().Count(), 3);
}

TEST(SavingAQuery, ThroughALinkThatLeadsNowhereYetMakesTheFileAndLeavesTheLink) {
    const TemporaryFolder folder;
    const SmallQuery small;
    fs::create_directory(folder / "disk");
    fs::create_symlink("disk/real.json", folder / "second.json");
    fs::create_symlink("second.json", folder / "first.json");
    ASSERT_EQ(errorOfSaving(folder / "first.json", small.query), "");
    EXPECT_TRUE(fs::is_symlink(folder / "first.json"));
    EXPECT_TRUE(fs::is_symlink(folder / "second.json"));
    EXPECT_TRUE(files::loadQuery(folder / "disk" / "real.json"));

    fs::remove_all(folder / "disk"); // as where it was mounted
    EXPECT_EQ(errorOfSaving(folder / "first.json", small.query),
              "The file \"" + (folder / "first.json").string() +
                  "\" cannot be saved (No such file or directory); check the path.");
    EXPECT_TRUE(fs::is_symlink(folder / "second.json"));
}

TEST(SavingAQuery, ThroughALinkToItselfIsRefused) {
    const TemporaryFolder folder;
    const SmallQuery small;
    fs::create_symlink("loop.json", folder / "loop.json");
    EXPECT_EQ(errorOfSaving(folder / "loop.json", small.query),
              "The file \"" + (folder / "loop.json").string() +
                  "\" cannot be saved (Too many levels of symbolic links); try again, or choose "
                  "another folder.");
    EXPECT_TRUE(fs::is_symlink(folder / "loop.json"));
}

TEST(SavingAQuery, UnderANameOfSeveralLinesMakesThatFile) {
    const TemporaryFolder folder;
    const SmallQuery small;
    const auto path = folder / "two\nlines.json";
    ASSERT_EQ(errorOfSaving(path, small.query), "");
    EXPECT_TRUE(files::loadQuery(path));
    EXPECT_EQ(std::distance(fs::directory_iterator(folder / ""), fs::directory_iterator()), 1);
    EXPECT_EQ(files::loadQuery(folder / "no\nfile").error(),
              "The file \"" + (folder / "no?file").string() +
                  "\" cannot be read (No such file or directory); check the path.");
}

TEST(SavingAQuery, UnderTheLongestNameWorksAndUnderALongerOneIsRefused) {
    const TemporaryFolder folder;
    const SmallQuery small;
    const std::string longest(255, 'n');
    EXPECT_EQ(errorOfSaving(folder / longest, small.query), "");
    EXPECT_EQ(errorOfSaving(folder / (longest + 'n'), small.query),
              "The file \"" + (folder / (longest + 'n')).string() +
                  "\" cannot be saved (File name too long); choose a shorter name.");
    EXPECT_EQ(errorOfSaving(folder / longest / "a.json", small.query),
              "The file \"" + (folder / longest / "a.json").string() +
                  "\" cannot be saved (Not a directory); check the path.");
}

TEST(SavingAQuery, SaysInOneLineWhyItCannot) {
    const TemporaryFolder folder;
    const SmallQuery small;
    EXPECT_EQ(errorOfSaving(folder / "none" / "a.json", small.query),
              "The file \"" + (folder / "none" / "a.json").string() +
                  "\" cannot be saved (No such file or directory); check the path.");
    fs::create_directory(folder / "b.json");
    EXPECT_EQ(errorOfSaving(folder / "b.json", small.query),
              '"' + (folder / "b.json").string() + "\" is not a file; choose another name.");
    ASSERT_EQ(::mkfifo((folder / "pipe").c_str(), 0600), 0);
    EXPECT_EQ(errorOfSaving(folder / "pipe", small.query),
              '"' + (folder / "pipe").string() + "\" is not a file; choose another name.");
    // No device of the system's: a test that fails would have replaced it.
    ASSERT_EQ(::mknod((folder / "socket").c_str(), S_IFSOCK | 0600, 0), 0);
    EXPECT_EQ(errorOfSaving(folder / "socket", small.query),
              '"' + (folder / "socket").string() + "\" is not a file; choose another name.");
}

TEST(LoadingAQuery, SaysInOneLineWhyItCannot) {
    const TemporaryFolder folder;
    EXPECT_EQ(files::loadQuery(folder / "none.json").error(),
              "The file \"" + (folder / "none.json").string() +
                  "\" cannot be read (No such file or directory); check the path.");
    EXPECT_EQ(files::loadQuery(folder / ".").error(),
              '"' + (folder / ".").string() + "\" is not a file; choose a query file.");
    ASSERT_EQ(::mkfifo((folder / "pipe").c_str(), 0600), 0);
    EXPECT_EQ(files::loadQuery(folder / "pipe").error(),
              '"' + (folder / "pipe").string() + "\" is not a file; choose a query file.");
    EXPECT_EQ(files::loadQuery("/dev/zero").error(),
              "\"/dev/zero\" is not a file; choose a query file.");
    std::ofstream(folder / "a\nb.json") << "{";
    const std::string error = files::loadQuery(folder / "a\nb.json").error();
    EXPECT_EQ(error.find('\n'), std::string::npos) << error;
}

TEST(LoadingAQuery, StopsAtTheLargestSize) {
    const TemporaryFolder folder;
    std::ofstream(folder / "large.json").close();
    fs::resize_file(folder / "large.json", 10'000'000'000); // takes no room: it has no content
    EXPECT_EQ(files::loadQuery(folder / "large.json").error(),
              "The file \"" + (folder / "large.json").string() +
                  "\" cannot be used: The file is larger than 64 MiB. Choose a query file.");
}

#include "Files.h"

#include "model/SmallQuery.h"
#include "support/FailingFiles.h"

#include <cstring>
#include <iostream>
#include <set>

using namespace zandor;

namespace {

using How = FailingFiles::How;

/// A query's file, saved, and the query with one table more.
struct ASavedFile : testing::Test {
    ASavedFile() {
        EXPECT_FALSE(files::saveQuery(path, small.query));
        before = contentOf(path);
        small.query->addTable(SmallQuery::described(u"third"));
        after = jsonOf(small.query);
    }

    const TemporaryFolder folder;
    const std::filesystem::path path = folder / "a.json";
    const std::string parent = std::filesystem::canonical(path.parent_path());
    SmallQuery small;
    std::string before;
    std::string after;
    const std::string reason = std::strerror(EIO);
};

} // namespace

TEST_F(ASavedFile, IsTheOldOneOrTheNewOneWhicheverCallFails) {
    std::multiset<std::string> refused;
    std::size_t nth = 1;
    for (;; ++nth) {
        std::size_t calls = 0;
        std::optional<files::Error> error;
        std::string failed;
        {
            const FailingFiles failing(parent, nth);
            error = files::saveQuery(path, small.query);
            calls = failing.calls();
            failed = failing.failed();
        }
        if (calls < nth) break;
        SCOPED_TRACE(failed);
        EXPECT_EQ(folder.names(), std::vector<std::string>{"a.json"});
        EXPECT_EQ(contentOf(path), error ? before : after);
        if (error) {
            refused.insert(failed);
            EXPECT_NE(error->text().find("a.json"), std::string::npos) << error->text();
        }
        // The next attempt finds nothing in its way.
        ASSERT_FALSE(files::saveQuery(path, small.query));
        ASSERT_EQ(contentOf(path), after);
        std::filesystem::remove(path);
        std::ofstream(path, std::ios::binary) << before;
    }
    std::cout << "[ FAULTS   ] " << nth - 1 << " calls of saving failed, " << refused.size()
              << " times the file stayed as it was\n";
    for (const char* call : {"access", "fchmod", "write", "fsync", "close", "rename"})
        EXPECT_TRUE(refused.contains(call)) << call;
    EXPECT_LT(refused.size(), nth - 1) << "what comes behind the new name is no failure any more";
}

TEST_F(ASavedFile, ThatIsNewLeavesNothingBehindWhicheverCallFails) {
    std::filesystem::remove(path);
    for (std::size_t nth = 1;; ++nth) {
        std::size_t calls = 0;
        std::optional<files::Error> error;
        {
            const FailingFiles failing(parent, nth);
            error = files::saveQuery(path, small.query);
            calls = failing.calls();
        }
        if (calls < nth) break;
        EXPECT_EQ(folder.names().empty(), error.has_value()) << "call " << nth;
        std::filesystem::remove(path);
    }
}

TEST_F(ASavedFile, IsReadWholeOrNotAtAllWhicheverCallFails) {
    std::size_t refused = 0;
    for (std::size_t nth = 1;; ++nth) {
        const FailingFiles failing(parent, nth);
        const auto document = files::loadQuery(path);
        if (failing.calls() < nth) break;
        SCOPED_TRACE(failing.failed());
        if (document) {
            EXPECT_EQ(document->query->Tables().Count(), 2);
            continue;
        }
        ++refused;
        EXPECT_NE(document.error().find(reason), std::string::npos) << document.error();
    }
    EXPECT_GE(refused, 3U);
}

TEST_F(ASavedFile, IsSavedAndReadThroughSignals) {
    {
        const FailingFiles failing(parent, 0, How::interrupts);
        ASSERT_FALSE(files::saveQuery(path, small.query));
    }
    EXPECT_EQ(contentOf(path), after);
    const FailingFiles failing(parent, 0, How::interrupts);
    const auto document = files::loadQuery(path);
    ASSERT_TRUE(document) << document.error();
    EXPECT_EQ(document->query->record(), small.query->record());
}

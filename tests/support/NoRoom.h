#pragma once

#include <gtest/gtest.h>

#include <sys/mount.h>
#include <sys/resource.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <functional>
#include <stdexcept>
#include <string>

/// While it lives, no file of this process grows beyond a size: the disk is full, as it were.
class LittleRoom {
public:
    explicit LittleRoom(rlim_t bytes) {
        getrlimit(RLIMIT_FSIZE, &mBefore);
        const rlimit little = {bytes, mBefore.rlim_max};
        mSignal = std::signal(SIGXFSZ, SIG_IGN);
        setrlimit(RLIMIT_FSIZE, &little);
    }
    LittleRoom(const LittleRoom&) = delete;
    LittleRoom& operator=(const LittleRoom&) = delete;
    ~LittleRoom() {
        setrlimit(RLIMIT_FSIZE, &mBefore);
        std::signal(SIGXFSZ, mSignal);
    }

private:
    rlimit mBefore = {};
    void (*mSignal)(int) = nullptr;
};

/// A small disk, where the system lets a test mount one.
class SmallDisk {
public:
    explicit SmallDisk(const std::string& size = "64k") {
        std::string name = std::filesystem::temp_directory_path() / "zandor-disk-XXXXXX";
        if (!::mkdtemp(name.data())) throw std::runtime_error("no folder for the test");
        mPath = name;
        const std::string options = "mode=700,size=" + size;
        if (::mount("tmpfs", mPath.c_str(), "tmpfs", 0, options.c_str()) == 0) return;
        mComplaint = std::strerror(errno);
    }
    SmallDisk(const SmallDisk&) = delete;
    SmallDisk& operator=(const SmallDisk&) = delete;
    ~SmallDisk() {
        if (mComplaint.empty()) ::umount2(mPath.c_str(), MNT_DETACH);
        std::filesystem::remove_all(mPath);
    }

    /// Why there is none; empty: there is.
    const std::string& complaint() const { return mComplaint; }
    const std::filesystem::path& path() const { return mPath; }

    /// Leaves not a byte.
    void fill() const {
        std::FILE* const file = std::fopen((mPath / "filling").c_str(), "wb");
        std::setbuf(file, nullptr);
        while (std::fputc('x', file) != EOF) {
        }
        std::fclose(file);
    }
    void clear() const { std::filesystem::remove(mPath / "filling"); }

private:
    std::filesystem::path mPath;
    std::string mComplaint;
};

/// Runs the tests of a suite twice: on a disk that is full, and, which any system can do, in a
/// process whose files may not grow.
class WithoutRoom : public testing::TestWithParam<bool> {
protected:
    void SetUp() override {
        if (isMounted() && !mDisk.complaint().empty())
            GTEST_SKIP() << "no disk can be mounted here: " << mDisk.complaint();
    }
    static bool isMounted() { return GetParam(); }
    std::filesystem::path folder() const { return mDisk.path(); }
    /// What the system says there.
    static std::string reason() {
        return isMounted() ? "No space left on device" : "File too large";
    }

    /// Runs something while there is no room for a byte.
    void withoutRoom(const std::function<void()>& run) {
        if (isMounted()) {
            mDisk.fill();
            run();
            return mDisk.clear();
        }
        const LittleRoom none(0);
        run();
    }

private:
    SmallDisk mDisk;
};

#define ZANDOR_WITHOUT_ROOM(suite)                                                                 \
    INSTANTIATE_TEST_SUITE_P(, suite, testing::Bool(), [](const auto& way) {                       \
        return std::string(way.param ? "OnAFullDisk" : "InAProcessThatMayNotWrite");               \
    })

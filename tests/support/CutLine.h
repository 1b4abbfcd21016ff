#pragma once

#include <QTemporaryDir>

#include <atomic>
#include <cstdint>
#include <thread>

/// A line to a server that hears through a socket, which can be cut after any number of the bytes
/// that the server says: to who is at its other end the server has died there.
class CutLine {
public:
    /// Under the name that the server's socket has, in a folder of its own. Throws
    /// std::runtime_error when it cannot be laid.
    explicit CutLine(const QString& socketOfServer);
    CutLine(const CutLine&) = delete;
    CutLine& operator=(const CutLine&) = delete;
    ~CutLine();

    QString folder() const { return mFolder.path(); }
    QString socket() const;

    /// From now on: is cut once so many bytes have passed, and nobody is let in any more.
    void cutAfter(std::int64_t bytes);
    /// Holds for good.
    void mend();
    /// How many bytes the server has said since either.
    std::int64_t passed() const { return mPassed; }

private:
    void serve();
    void carry(int client);
    bool pass(int from, int to, bool counted);

    QTemporaryDir mFolder;
    const QString mServer;
    int mListening = -1;
    std::atomic<std::int64_t> mMost;
    std::atomic<std::int64_t> mPassed = 0;
    std::atomic<bool> mEnding = false;
    std::thread mServing;
};

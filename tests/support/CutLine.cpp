#include "support/CutLine.h"

#include <QFileInfo>

#include <poll.h>
#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

#include <algorithm>
#include <cstring>
#include <limits>
#include <stdexcept>

namespace {

constexpr std::int64_t endless = std::numeric_limits<std::int64_t>::max();
constexpr int tick = 20; // milliseconds, after which a line looks whether it is to end

sockaddr_un addressOf(const QString& path) {
    sockaddr_un address = {};
    address.sun_family = AF_UNIX;
    const QByteArray name = path.toLocal8Bit();
    if (static_cast<std::size_t>(name.size()) >= sizeof address.sun_path)
        throw std::runtime_error("the path of a socket is too long");
    std::memcpy(address.sun_path, name.constData(), static_cast<std::size_t>(name.size()));
    return address;
}

template <class Call>
int socketWith(const QString& path, Call call) {
    const sockaddr_un address = addressOf(path);
    const int made = ::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0);
    if (made >= 0 && call(made, reinterpret_cast<const sockaddr*>(&address), sizeof address) == 0)
        return made;
    if (made >= 0) ::close(made);
    return -1;
}

} // namespace

CutLine::CutLine(const QString& socketOfServer) : mServer(socketOfServer), mMost(endless) {
    mListening = socketWith(socket(), ::bind);
    if (mListening < 0 || ::listen(mListening, 8) != 0)
        throw std::runtime_error("no socket for the line to a server");
    mServing = std::thread([this] { serve(); });
}

CutLine::~CutLine() {
    mEnding = true;
    mServing.join();
    ::close(mListening);
}

QString CutLine::socket() const { return mFolder.filePath(QFileInfo(mServer).fileName()); }

void CutLine::cutAfter(std::int64_t bytes) {
    mPassed = 0;
    mMost = bytes;
}

void CutLine::mend() { cutAfter(endless); }

void CutLine::serve() {
    while (!mEnding) {
        pollfd waiting = {mListening, POLLIN, 0};
        if (::poll(&waiting, 1, tick) <= 0) continue;
        const int client = ::accept4(mListening, nullptr, nullptr, SOCK_CLOEXEC);
        if (client < 0) continue;
        if (mPassed < mMost) carry(client);
        ::close(client);
    }
}

/// Until either side hangs up, or it is cut.
void CutLine::carry(int client) {
    const int server = socketWith(mServer, ::connect);
    if (server < 0) return;
    bool on = true;
    while (on && !mEnding) {
        pollfd ends[] = {{client, POLLIN, 0}, {server, POLLIN, 0}};
        if (::poll(ends, 2, tick) <= 0) continue;
        if (ends[0].revents != 0) on = pass(client, server, false);
        if (on && ends[1].revents != 0) on = pass(server, client, true);
    }
    ::close(server);
}

bool CutLine::pass(int from, int to, bool counted) {
    char bytes[16 * 1024];
    const ssize_t count = ::recv(from, bytes, sizeof bytes, 0);
    if (count <= 0) return false;
    const std::int64_t allowed =
        counted ? std::min<std::int64_t>(count, mMost - mPassed) : std::int64_t{count};
    if (counted) mPassed += allowed;
    for (std::int64_t sent = 0; sent < allowed;) {
        const ssize_t now =
            ::send(to, bytes + sent, static_cast<std::size_t>(allowed - sent), MSG_NOSIGNAL);
        if (now <= 0) return false;
        sent += now;
    }
    return allowed == count && mPassed < mMost;
}

#include "designer/run/Spool.h"

#include "designer/document/paths.h"
#include "designer/statement/ModelWords.h"

#include <QCoreApplication>
#include <QDir>
#include <QFileInfo>
#include <QStorageInfo>

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <cstring>

namespace zandor::designer {

namespace {

constexpr qsizetype mostPending = qsizetype{256} * 1024;
constexpr qint64 roomLeftToOthers = qint64{256} * 1024 * 1024;

void append(QByteArray& bytes, const Cell& cell) {
    bytes += static_cast<char>(cell.kind);
    if (cell.kind == Cell::Kind::null) return;
    const QByteArray text =
        cell.kind == Cell::Kind::blob ? QByteArray::number(cell.blob.size()) : cell.text.toUtf8();
    const auto size = static_cast<quint32>(text.size());
    bytes.append(reinterpret_cast<const char*>(&size), sizeof size);
    bytes += text;
}

/// The beginning of a text without its last character, of which there may be a part only.
QString shortened(const QByteArray& text) {
    qsizetype end = text.size();
    while (end > 0 && (text[end - 1] & 0xC0) == 0x80) --end;
    return QString::fromUtf8(text.left(std::max<qsizetype>(end - 1, 0))) + u'\u2026';
}

/// A file of no name, that nobody else can open and that no end of the process leaves behind.
files::Descriptor namelessFile(const QString& folder) {
    const files::Path path = pathOf(folder);
    constexpr mode_t owner = 0600;
#ifdef O_TMPFILE
    files::Descriptor file(::open(path.c_str(), O_TMPFILE | O_RDWR | O_CLOEXEC, owner));
    if (file.isOpen()) return file;
#endif
    // Not every file system can do that.
    std::string name = path / (spoolName + QStringLiteral("XXXXXX")).toStdString();
    files::Descriptor named(::mkostemp(name.data(), O_CLOEXEC));
    if (named.isOpen()) ::unlink(name.c_str());
    return named;
}

/// Reads a file from a place on, without moving the place where others read and write.
class Reading {
public:
    Reading(int file, qint64 from) : mFile(file), mNext(from) {}

    bool read(char* into, qint64 bytes) {
        while (bytes > 0) {
            if (mPlace == mPiece.size() && !fetch()) return false;
            const qint64 taken = std::min<qint64>(bytes, mPiece.size() - mPlace);
            std::memcpy(into, mPiece.constData() + mPlace, static_cast<std::size_t>(taken));
            mPlace += taken;
            into += taken;
            bytes -= taken;
        }
        return true;
    }
    void skip(qint64 bytes) {
        const qint64 here = std::min<qint64>(bytes, mPiece.size() - mPlace);
        mPlace += here;
        mNext += bytes - here;
    }

private:
    bool fetch() {
        constexpr qsizetype piece = qsizetype{64} * 1024;
        mPiece.resize(piece);
        mPlace = 0;
        ssize_t count = 0;
        do count = ::pread(mFile, mPiece.data(), piece, mNext);
        while (count < 0 && errno == EINTR);
        mPiece.resize(std::max<ssize_t>(count, 0));
        mNext += mPiece.size();
        return count > 0;
    }

    const int mFile;
    qint64 mNext;
    QByteArray mPiece;
    qsizetype mPlace = 0;
};

bool read(Reading& file, Cell& cell, qint64 mostBytes) {
    char kind = 0;
    if (!file.read(&kind, 1)) return false;
    cell.kind = static_cast<Cell::Kind>(kind);
    if (cell.kind == Cell::Kind::null) return true;
    quint32 size = 0;
    if (!file.read(reinterpret_cast<char*>(&size), sizeof size)) return false;
    const qint64 taken = std::min<qint64>(size, mostBytes);
    QByteArray text(taken, Qt::Uninitialized);
    if (!file.read(text.data(), taken)) return false;
    file.skip(size - taken);
    cell.text = taken == size ? QString::fromUtf8(text) : shortened(text);
    return true;
}

} // namespace

// The folder /tmp may be in memory, which large files are to stay out of.
QString spoolFolder() {
    const QString large = QStringLiteral("/var/tmp");
    const bool chosen = qEnvironmentVariableIsSet("TMPDIR");
    return !chosen && QFileInfo(large).isWritable() ? large : QDir::tempPath();
}

std::optional<QString> Spool::begin(const QStringList& columns) {
    const std::lock_guard lock(mMutex);
    mColumns = columns;
    mFile = namelessFile(spoolFolder());
    if (mFile.isOpen()) return {};
    return QCoreApplication::translate("zandor::designer::Spool",
                                       "No file for the rows can be made in \"%1\" (%2): set "
                                       "TMPDIR to a folder that you may write to.")
        .arg(spoolFolder(), qt_error_string(errno));
}

std::optional<QString> Spool::add(const Row& row) {
    const std::lock_guard lock(mMutex);
    if (mRows % rowsInAPage == 0) mPages.push_back(mEnd);
    const qsizetype before = mPending.size();
    for (const Cell& cell : row) append(mPending, cell);
    mEnd += mPending.size() - before;
    ++mRows;
    return mPending.size() < mostPending ? mFailure : flush();
}

std::optional<QString> Spool::finish() {
    const std::lock_guard lock(mMutex);
    return flush();
}

QStringList Spool::columns() const {
    const std::lock_guard lock(mMutex);
    return mColumns;
}

// What is pending is written when somebody looks: behind a slow engine it could stay so for long.
qint64 Spool::rows() {
    const std::lock_guard lock(mMutex);
    flush();
    return mReadable;
}

std::vector<Row> Spool::page(qint64 number, qint64 mostBytes) {
    std::unique_lock lock(mMutex);
    flush();
    const qint64 first = number * rowsInAPage;
    if (first < 0 || first >= mReadable) return {};
    const auto count = static_cast<std::size_t>(std::min(rowsInAPage, mReadable - first));
    const qint64 begin = mPages[static_cast<std::size_t>(number)];
    const auto columns = static_cast<std::size_t>(mColumns.size());
    Reading file(mFile.number(), begin);
    lock.unlock();

    std::vector<Row> rows(count, Row(columns));
    for (Row& row : rows)
        for (Cell& cell : row)
            if (!read(file, cell, mostBytes)) return {};
    return rows;
}

std::optional<QString> Spool::flush() {
    if (mFailure || mPending.isEmpty()) return mFailure;
    if (mEnd >= mNextLook) {
        mNextLook = mEnd + bytesBetweenLooks;
        if (QStorageInfo(spoolFolder()).bytesAvailable() < roomLeftToOthers)
            mFailure = QCoreApplication::translate(
                           "zandor::designer::Spool",
                           "The rows would fill the disk with the folder \"%1\": make room there, "
                           "or ask for fewer rows.")
                           .arg(spoolFolder());
    }
    if (!mFailure) mFailure = written();
    if (!mFailure) mReadable = mRows;
    mPending.resize(0); // and keeps its room
    return mFailure;
}

std::optional<QString> Spool::written() const {
    const std::string_view bytes(mPending.constData(), static_cast<std::size_t>(mPending.size()));
    if (files::writeAll(mFile.number(), bytes)) return {};
    const int why = errno;
    const QString failed =
        QCoreApplication::translate("zandor::designer::Spool", "The rows cannot be written");
    return inWords(files::systemError(
        model::say<model::MessageCode::asItStands>(failed.toStdU16String()), why));
}

} // namespace zandor::designer

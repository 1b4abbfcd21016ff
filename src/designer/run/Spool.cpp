#include "designer/run/Spool.h"

#include "designer/run/writeAll.h"

#include <QCoreApplication>
#include <QDataStream>
#include <QDir>
#include <QFileInfo>
#include <QStorageInfo>

namespace designer {

namespace {

constexpr qsizetype mostPending = 1 << 18;
constexpr qint64 betweenLooks = 1 << 26;
constexpr qint64 roomLeftToOthers = 1 << 28;

/// The folder /tmp may be in memory, which large files are to stay out of.
QString folder() {
    const QString large = QStringLiteral("/var/tmp");
    const bool chosen = qEnvironmentVariableIsSet("TMPDIR");
    return !chosen && QFileInfo(large).isWritable() ? large : QDir::tempPath();
}

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

bool read(QIODevice& device, Cell& cell, qint64 mostBytes) {
    char kind = 0;
    if (!device.getChar(&kind)) return false;
    cell.kind = static_cast<Cell::Kind>(kind);
    if (cell.kind == Cell::Kind::null) return true;
    quint32 size = 0;
    if (device.read(reinterpret_cast<char*>(&size), sizeof size) != sizeof size) return false;
    const qint64 taken = std::min<qint64>(size, mostBytes);
    const QByteArray text = device.read(taken);
    if (text.size() != taken || device.skip(size - taken) != size - taken) return false;
    cell.text = taken == size ? QString::fromUtf8(text) : shortened(text);
    return true;
}

} // namespace

std::optional<QString> Spool::begin(const QStringList& columns) {
    const std::lock_guard lock(mMutex);
    mColumns = columns;
    mFile.setFileTemplate(QDir(folder()).filePath(QStringLiteral("zandor-rows-XXXXXX")));
    // Not through a buffer, so that a page can be read as soon as it is written.
    if (static_cast<QIODevice&>(mFile).open(QIODevice::ReadWrite | QIODevice::Unbuffered))
        return {};
    return QCoreApplication::translate("designer::Spool",
                                       "No file for the rows can be made in \"%1\" (%2): set "
                                       "TMPDIR to a folder that you may write to.")
        .arg(folder(), mFile.errorString());
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
    QFile file(mFile.fileName());
    lock.unlock();

    std::vector<Row> rows(count, Row(columns));
    if (!file.open(QIODevice::ReadOnly) || !file.seek(begin)) return {};
    for (Row& row : rows)
        for (Cell& cell : row)
            if (!read(file, cell, mostBytes)) return {};
    return rows;
}

std::optional<QString> Spool::flush() {
    if (mFailure || mPending.isEmpty()) return mFailure;
    if (mEnd >= mNextLook) {
        mNextLook = mEnd + betweenLooks;
        if (QStorageInfo(QFileInfo(mFile.fileName()).path()).bytesAvailable() < roomLeftToOthers)
            mFailure = QCoreApplication::translate(
                           "designer::Spool",
                           "The rows would fill the disk with the folder \"%1\": make room there, "
                           "or ask for fewer rows.")
                           .arg(folder());
    }
    if (!mFailure) mFailure = writeAll(mFile, mPending);
    if (!mFailure) mReadable = mRows;
    mPending.resize(0); // and keeps its room
    return mFailure;
}

} // namespace designer

#pragma once

#include "designer/run/fetch.h"

#include <Zandor/files/Descriptor.h>

#include <mutex>

namespace zandor::designer {

/// How the files of spools are named where they have a name, before six letters and digits: for a
/// moment on some systems, and for as long as they are read by versions before.
inline const QString spoolName = QStringLiteral("zandor-rows-");
/// Where they are made.
QString spoolFolder();

/// The rows of a result on the disk, to be read page by page while more are coming.
///
/// All rows are taken as fast as the engine gives them, whether anybody looks at them or not: the
/// engine then neither holds a lock nor a snapshot while a user reads, going back needs no second
/// run, and the number of rows gets known. In memory is one number a page. The rows come from one
/// thread, as of a Sink; the other members may be called from one more.
class Spool final : public Sink {
public:
    static constexpr qint64 rowsInAPage = 256;

    std::optional<QString> begin(const QStringList& columns) override;
    std::optional<QString> add(const Row& row) override;
    std::optional<QString> finish() override;

    QStringList columns() const;
    /// How many rows can be read by now.
    qint64 rows();
    /// The rows of a page, as far as they are there. Of every text no more than `mostBytes` of its
    /// UTF-8 are read, with an ellipsis behind where it is longer; the text of a blob is the number
    /// of its bytes. A page that the disk does not give back has no rows.
    std::vector<Row> page(qint64 number, qint64 mostBytes);

private:
    static constexpr qint64 bytesBetweenLooks =
        qint64{64} * 1024 * 1024; ///< at the room on the disk

    std::optional<QString> flush();
    std::optional<QString> written() const;

    mutable std::mutex mMutex;
    QStringList mColumns;
    files::Descriptor mFile; ///< that has no name: it is gone with the process, however that ends
    QByteArray mPending;     ///< not in the file yet
    qint64 mEnd = 0;         ///< of the file and what is pending
    qint64 mNextLook = bytesBetweenLooks; ///< when so much is written
    qint64 mRows = 0;
    qint64 mReadable = 0;       ///< those in the file
    std::vector<qint64> mPages; ///< where they begin
    std::optional<QString> mFailure;
};

} // namespace zandor::designer

#pragma once

#include <QSqlResult>

#include <memory>
#include <vector>

class QSqlDatabase;

namespace zandor::designer {

/// The rows of a statement of MySQL as the engine writes them, one after the other: a moment with
/// all its digits, also one of no calendar, and a text in any collation. Qt's own result makes of
/// a moment what Qt can hold, of bits a text, and of a failure between two rows the last one.
///
/// Forward only, for statements without placeholders; of several statements the first one's rows.
/// Values are texts but for whole numbers, bits, which are numbers, and bytes. An error is
/// the engine's own; no row comes after one.
class MysqlResult final : public QSqlResult {
public:
    /// On the connection of a driver, for a query to own; nothing where the driver's library is
    /// none of MySQL's or MariaDB's.
    static QSqlResult* over(const QSqlDatabase& database);

    ~MysqlResult() override;

protected:
    bool reset(const QString& statement) override;
    bool fetchFirst() override;
    bool fetchNext() override;
    bool fetchLast() override { return false; }
    bool fetch(int) override { return false; }
    QVariant data(int column) override;
    bool isNull(int column) override;
    int size() override { return -1; }
    int numRowsAffected() override { return -1; }
    QSqlRecord record() const override;
    void detachFromResultSet() override { end(); }

private:
    struct Library;
    struct Field;
    enum class Kind { whole, natural, number, bits, text, bytes };

    MysqlResult(const QSqlDatabase& database, void* connection,
                std::unique_ptr<const Library> library);
    static Kind kindOf(const Field& field);
    QByteArray bytesAt(int column) const;
    bool failed(const QString& what);
    void end();

    void* const mConnection; ///< MYSQL, the driver's
    const std::unique_ptr<const Library> mLibrary;
    bool mSent = false;    ///< and what the engine has for it not all taken
    void* mRows = nullptr; ///< MYSQL_RES
    std::vector<Kind> mKinds;
    const char* const* mRow = nullptr;
    const unsigned long* mLengths = nullptr;
};

} // namespace zandor::designer

#include "MysqlSchema.h"

using namespace zandor;

namespace {

class AConnectionToMariaDB : public MysqlSchema {};

QString here() { return QStringLiteral("here"); }

std::string errorOf(const QString& address) {
    const auto opened = reader::openDatabase(address);
    EXPECT_FALSE(opened) << address.toStdString();
    EXPECT_FALSE(opened.error().contains(u'\n'));
    return opened.error().toStdString();
}

bool endsWith(const std::string& text, const std::string& end) {
    return text.size() >= end.size() && text.substr(text.size() - end.size()) == end;
}

} // namespace

TEST_F(AConnectionToMariaDB, CannotWriteNotEvenByAFunction) {
    run({QStringLiteral("CREATE TABLE t (x int)"),
         QStringLiteral("CREATE FUNCTION w() RETURNS int BEGIN INSERT INTO t VALUES (1); "
                        "RETURN 1; END"),
         QStringLiteral("CREATE VIEW v AS SELECT w() AS x")});
    for (const char* statement :
         {"INSERT INTO t VALUES (2)", "SELECT x FROM v", "CREATE TABLE u (x int)"}) {
        QSqlQuery query(database());
        EXPECT_FALSE(query.exec(QLatin1String(statement)) && !query.lastError().isValid());
        EXPECT_TRUE(query.lastError().databaseText().contains(QStringLiteral("READ ONLY")))
            << statement << ": " << query.lastError().text().toStdString();
    }
    QSqlQuery rows(database());
    ASSERT_TRUE(rows.exec(QStringLiteral("SELECT count(*) FROM t")) && rows.next());
    EXPECT_EQ(rows.value(0).toInt(), 0);
}

TEST_F(AConnectionToMariaDB, ReadsBackslashesAsTheDialectWritesThemWhateverTheServerDoes) {
    runOnMaria(
        {QStringLiteral("SET GLOBAL sql_mode = 'NO_BACKSLASH_ESCAPES,STRICT_TRANS_TABLES'")});
    QSqlQuery query(database());
    ASSERT_TRUE(query.exec(QStringLiteral("SELECT '\\\\' = CHAR(92), 'a_' LIKE 'a\\_'")));
    ASSERT_TRUE(query.next());
    EXPECT_TRUE(query.value(0).toBool());
    EXPECT_TRUE(query.value(1).toBool());
    runOnMaria({QStringLiteral("SET GLOBAL sql_mode = DEFAULT")});
}

TEST_F(AConnectionToMariaDB, SaysWhatItWasRefusedFor) {
    runOnMaria({QStringLiteral("CREATE OR REPLACE USER guest@localhost"),
                QStringLiteral("CREATE OR REPLACE USER locked@localhost IDENTIFIED BY 'secret'")});
    EXPECT_TRUE(
        endsWith(errorOf(mariaAddress(QStringLiteral("gone"))), "check the name of the database."));
    EXPECT_TRUE(endsWith(errorOf(mariaAddress(here(), QStringLiteral("nobody"))),
                         "check the user name and the password."));
    EXPECT_TRUE(endsWith(errorOf(mariaAddress(here(), QStringLiteral("guest"))),
                         "ask the server's administrator to let you in."));
    const auto locked = reader::openDatabase(mariaAddress(here(), QStringLiteral("locked")));
    EXPECT_TRUE(reader::asksForPassword(locked.failure()));
    const auto guest = reader::openDatabase(mariaAddress(here(), QStringLiteral("guest")));
    EXPECT_FALSE(reader::asksForPassword(guest.failure()));
    EXPECT_TRUE(endsWith(errorOf(QStringLiteral("mysql://root@localhost/x?host=/nowhere/socket")),
                         "see that the server runs, and check host and port."));
}

TEST_F(AConnectionToMariaDB, TakesTheOptionsThatItKnows) {
    const QString address = mariaAddress(here());
    EXPECT_TRUE(reader::openDatabase(address + QStringLiteral("&connect_timeout=5")));
    EXPECT_EQ(errorOf(address + QStringLiteral("&sslmode=require")),
              "The address has an unknown option \"sslmode\"; known are sslrootcert, sslcert, "
              "sslkey, connect_timeout and host.");
    EXPECT_EQ(errorOf(address + QStringLiteral(";x")),
              "The option host of the address has a semicolon in it; use a value without one.");
}

TEST_F(AConnectionToMariaDB, ReadsTheTablesOfWhoMayOnlyRead) {
    run({QStringLiteral("CREATE TABLE p (id int PRIMARY KEY)"),
         QStringLiteral("CREATE TABLE c (p int REFERENCES p (id))"),
         QStringLiteral("CREATE OR REPLACE USER guest@localhost"),
         QStringLiteral("GRANT SELECT ON here.* TO guest@localhost")});
    open(mariaAddress(here(), QStringLiteral("guest")));
    EXPECT_EQ(tables().size(), 2U);
    EXPECT_TRUE(columns({u"", u"p"}).front().primaryKey);
    EXPECT_EQ(foreignKeys({u"", u"c"}).size(), 1U);
}

TEST_F(AConnectionToMariaDB, SaysThatTheServerEndedIt) {
    ASSERT_TRUE(schema().tables());
    QSqlQuery id(database());
    ASSERT_TRUE(id.exec(QStringLiteral("SELECT CONNECTION_ID()")) && id.next());
    runOnMaria({QStringLiteral("KILL CONNECTION %1").arg(id.value(0).toInt())});
    const QString error = schema().tables().error();
    EXPECT_TRUE(error.startsWith(QStringLiteral("The list of tables cannot be read (")))
        << error.toStdString();
    EXPECT_TRUE(error.endsWith(QStringLiteral("open the database afresh."))) << error.toStdString();
    EXPECT_FALSE(error.contains(u'\n'));
}

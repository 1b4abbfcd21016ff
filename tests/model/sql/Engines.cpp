#include "Engines.h"

#include "model/criteria/Literals.h"

#include <Zandor/reader/bindValue.h>

#include <QDateTime>
#include <QFile>
#include <QRegularExpression>
#include <QSqlDriver>
#include <QSqlError>
#include <QSqlQuery>
#include <QSqlRecord>
#include <QTime>
#include <QVariant>

#include <iostream>
#include <stdexcept>

using namespace zandor;

using model::sql::Dialect;

namespace {

QString written(const QVariant& value) {
    if (value.isNull()) return QStringLiteral("null");
    switch (value.typeId()) {
    case QMetaType::Bool: return value.toBool() ? QStringLiteral("1") : QStringLiteral("0");
    case QMetaType::QDate: return value.toDate().toString(Qt::ISODate);
    case QMetaType::QTime: return value.toTime().toString(QStringLiteral("HH:mm:ss"));
    case QMetaType::QDateTime:
        return value.toDateTime().toString(QStringLiteral("yyyy-MM-dd HH:mm:ss"));
    case QMetaType::QByteArray: return QString::fromLatin1(value.toByteArray().toHex());
    case QMetaType::QString: return u'\'' + value.toString() + u'\'';
    default: break;
    }
    // Exact decimals here, doubles there: the same up to the digits that both have.
    return QString::number(value.toDouble(), 'g', 12);
}

/// SQLite's moments are texts; a quoted text is one only when it cannot be a moment.
QString unquotedMoment(QString text) {
    static const QRegularExpression moment(
        QStringLiteral("^'(\\d{4}-\\d\\d-\\d\\d( \\d\\d:\\d\\d:\\d\\d)?|\\d\\d:\\d\\d:\\d\\d)'$"));
    if (moment.match(text).hasMatch()) text = text.mid(1, text.size() - 2);
    return text;
}

QString connectionName(const QString& engine, const QString& name) { return engine + u'-' + name; }

std::unique_ptr<Servers>& servers() {
    static std::unique_ptr<Servers> theServers;
    return theServers;
}

Servers& startedServers() {
    if (servers()) return *servers();
    servers() = std::make_unique<Servers>();
    if (const auto missing = MariaServer::missing())
        std::cout << "Not on MariaDB: " << missing->toStdString() << '\n';
    else
        servers()->maria.emplace();
    return *servers();
}

std::unique_ptr<Engines>& engines(bool small) {
    static std::unique_ptr<Engines> sampleOnes;
    static std::unique_ptr<Engines> smallOnes;
    return small ? smallOnes : sampleOnes;
}

void addOddNames(const QSqlDatabase& sqlite) {
    QFile file(QStringLiteral(CORPUS "/odd_names.sql"));
    if (!file.open(QIODevice::ReadOnly)) throw std::runtime_error("no odd_names.sql");
    for (const QString& line : QString::fromUtf8(file.readAll()).split(u'\n'))
        if (!line.isEmpty() && !line.startsWith(u"--")) run(sqlite, line);
}

/// A few rows a table: a random query may join every row with every other.
void shrink(const QSqlDatabase& sqlite) {
    addOddNames(sqlite);
    static const std::pair<const char*, const char*> kept[] = {
        {"countries", "code < 'ES'"},
        {"employees", "id <= 8"},
        {"customers", "id <= 7 OR id = 60"},
        {"contacts", "id <= 8"},
        {"suppliers", "id <= 7"},
        {"categories", "id <= 7"},
        {"products", "id <= 5 OR id IN (17, 34, 98)"},
        {"stock", "product_id <= 3"},
        {"orders", "id <= 6 OR id IN (29, 1750)"},
        {"order_lines", "order_id <= 3"},
        {"shipments", "id <= 6"},
        {"shipment_lines", "order_id <= 3"},
        {"payments", "order_id <= 8"},
    };
    for (const auto& [table, condition] : kept)
        run(sqlite, QStringLiteral("DELETE FROM %1 WHERE NOT (%2)").arg(table, condition));
}

} // namespace

Engines::Engines(Servers& servers, const QString& name, const Prepare& prepare) {
    const QString file = mDirectory.filePath(QStringLiteral("sample.sqlite"));
    if (!QFile::copy(QStringLiteral(SAMPLE_DATABASE), file))
        throw std::runtime_error("the sample database could not be copied");
    QSqlDatabase sqlite =
        QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), connectionName(u"s"_qs, name));
    sqlite.setDatabaseName(file);
    if (!sqlite.open()) throw std::runtime_error(sqlite.lastError().text().toStdString());
    prepare(sqlite);

    QSqlDatabase postgres = servers.postgres.connect(connectionName(u"p"_qs, name));
    if (!postgres.isOpen()) throw std::runtime_error(postgres.lastError().text().toStdString());
    ::run(postgres, QStringLiteral("CREATE SCHEMA %1").arg(name));
    ::run(postgres, QStringLiteral("SET search_path = %1").arg(name));
    copyToServer(sqlite, postgres);

    mDatabases = {{Dialect::SQLite, sqlite}, {Dialect::PostgreSQL, postgres}};
    if (servers.maria) {
        QSqlDatabase maria = servers.maria->connect(connectionName(u"m"_qs, name));
        if (!maria.isOpen()) throw std::runtime_error(maria.lastError().text().toStdString());
        // Takes no notice of case, which `Like` must not and none of the values depends on, but of
        // accents and blanks, as the others do.
        ::run(maria,
              QStringLiteral("CREATE DATABASE %1 COLLATE utf8mb4_uca1400_nopad_as_ci").arg(name));
        ::run(maria, QStringLiteral("USE %1").arg(name));
        copyToServer(sqlite, maria);
        mDatabases.emplace(Dialect::MySQL, maria);
    }
    mReader = reader::makeSqliteReader(sqlite);
}

Engines::~Engines() {
    mReader.reset();
    for (auto& [dialect, database] : mDatabases) {
        const QString name = database.connectionName();
        database = {};
        QSqlDatabase::removeDatabase(name);
    }
}

std::vector<Dialect> Engines::dialects() const {
    std::vector<Dialect> dialects;
    for (const auto& [dialect, database] : mDatabases) dialects.push_back(dialect);
    return dialects;
}

const QSqlDatabase& Engines::database(Dialect dialect) const { return mDatabases.at(dialect); }

Outcome Engines::runCommon(Dialect dialect, const QString& statement) const {
    if (dialect != Dialect::MySQL) return run(dialect, statement);
    const QSqlDatabase& maria = database(dialect);
    const QString mode = QStringLiteral("SET sql_mode = ");
    ::run(maria, mode + QStringLiteral("'ANSI_QUOTES,PIPES_AS_CONCAT,NO_BACKSLASH_ESCAPES'"));
    Outcome outcome = run(dialect, statement);
    ::run(maria, mode + QStringLiteral("DEFAULT"));
    return outcome;
}

Outcome Engines::run(Dialect dialect, const QString& statement, const QVariantList& values) const {
    QSqlQuery query(database(dialect));
    query.setForwardOnly(true);
    // Without values not prepared: the driver would look for placeholders in the texts.
    const bool prepared = values.isEmpty() || query.prepare(statement);
    for (const QVariant& value : values) query.addBindValue(value);
    if (!prepared || !(values.isEmpty() ? query.exec(statement) : query.exec()))
        return {{}, query.lastError().text()};
    Outcome outcome;
    const int columns = query.record().count();
    while (query.next()) {
        QStringList row;
        for (int i = 0; i < columns; ++i) row << unquotedMoment(written(query.value(i)));
        outcome.rows << row.join(u" | ");
    }
    return outcome;
}

Outcome Engines::run(Dialect dialect, const model::sql::Text& text,
                     const std::map<std::string, std::string>& answers) const {
    QVariantList values;
    for (const auto& binding : text.bindings) {
        if (const auto* value = std::get_if<model::sql::Value>(&binding)) {
            values << reader::bindValue(*value, dialect);
            continue;
        }
        const auto& parameter = std::get<model::sql::Parameter>(binding);
        const auto answer = answers.find(platform::toUtf8(parameter.name));
        if (answer == answers.end()) return {{}, QStringLiteral("no answer to a parameter")};
        const auto typed = platform::fromUtf8(answer->second);
        auto value = parameter.pattern
                         ? model::sql::Value{model::ColumnType::Text,
                                             model::sql::likePattern(
                                                 model::criteria::likePattern(typed), dialect)}
                         : model::criteria::literal(typed, parameter.type);
        if (!value) return {{}, QStringLiteral("the answer does not fit the parameter")};
        values << reader::bindValue(*value, dialect);
    }
    return run(dialect, QString::fromStdU16String(text.text), values);
}

Engines& sampleEngines() {
    auto& theirs = engines(false);
    if (!theirs) theirs = std::make_unique<Engines>(startedServers(), u"sample"_qs, addOddNames);
    return *theirs;
}

Engines& smallEngines() {
    auto& theirs = engines(true);
    if (!theirs) theirs = std::make_unique<Engines>(startedServers(), u"small"_qs, shrink);
    return *theirs;
}

void stopEngines() {
    engines(false).reset();
    engines(true).reset();
    servers().reset();
}

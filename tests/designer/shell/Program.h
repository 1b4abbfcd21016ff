#pragma once

#include <Zandor/Query.h>

#include <QMap>
#include <QProcess>
#include <QStringList>

#include <memory>

/// The designer's program in a shell, where no display can be reached.
struct Ended {
    int code = -1;
    std::string out;
    std::string err;
};

/// Starts it; the end of the object is the end of the program.
std::unique_ptr<QProcess> start(const QStringList& arguments,
                                const QMap<QString, QString>& environment = {});
/// Waits for its end.
Ended end(QProcess& program);
Ended runProgram(const QStringList& arguments, const QMap<QString, QString>& environment = {});

/// Saves a query with the address of its database.
void save(const QString& path, const zandor::platform::Ref<zandor::model::Query>& query,
          const QString& database = {});

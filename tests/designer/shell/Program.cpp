#include "Program.h"

#include <Zandor/QueryDocument.h>

#include <gtest/gtest.h>

#include <QProcessEnvironment>

using namespace zandor;

std::unique_ptr<QProcess> start(const QStringList& arguments,
                                const QMap<QString, QString>& environment) {
    auto program = std::make_unique<QProcess>();
    auto variables = QProcessEnvironment::systemEnvironment();
    for (const char* name : {"DISPLAY", "WAYLAND_DISPLAY", "PGPASSWORD"})
        variables.remove(QLatin1String(name));
    variables.insert("QT_QPA_PLATFORM", "no-such-platform"); // none is asked for
    for (auto it = environment.begin(); it != environment.end(); ++it)
        variables.insert(it.key(), it.value());
    program->setProcessEnvironment(variables);
    program->setStandardInputFile(QProcess::nullDevice());
    // In a session of its own there is no terminal that could be asked for a password.
    program->start("setsid", QStringList{"--wait", ZANDOR_DESIGNER} + arguments);
    EXPECT_TRUE(program->waitForStarted()) << program->errorString().toStdString();
    return program;
}

Ended end(QProcess& program) {
    if (program.state() != QProcess::NotRunning) {
        EXPECT_TRUE(program.waitForFinished(60'000)) << program.errorString().toStdString();
    }
    EXPECT_EQ(program.exitStatus(), QProcess::NormalExit);
    return {program.exitCode(), program.readAllStandardOutput().toStdString(),
            program.readAllStandardError().toStdString()};
}

Ended runProgram(const QStringList& arguments, const QMap<QString, QString>& environment) {
    return end(*start(arguments, environment));
}

void save(const QString& path, const platform::Ref<model::Query>& query, const QString& database) {
    files::QueryDocument document(query);
    document.database = database.toStdU16String();
    const auto error = files::saveQuery(path.toStdString(), document);
    EXPECT_FALSE(error) << error->text();
}

#include <gmock/gmock.h>

#include <QProcess>
#include <QProcessEnvironment>

using testing::ElementsAre;
using testing::HasSubstr;

namespace {

/// What the designer says where the system speaks a language: the statement panel's invitation, the
/// options dialog's title and Cancel button, and the control's menu entry for deleting a table.
std::vector<std::string> saidIn(const QString& language) {
    QProcess process;
    auto environment = QProcessEnvironment::systemEnvironment();
    for (const char* name : {"LANGUAGE", "LC_ALL", "LC_MESSAGES"})
        environment.remove(QLatin1String(name));
    environment.insert("LANG", language);
    environment.insert("QT_QPA_PLATFORM", "offscreen");
    process.setProcessEnvironment(environment);
    process.start(SPEAKING_PROBE, QStringList());
    EXPECT_TRUE(process.waitForFinished(60000));
    EXPECT_EQ(process.exitCode(), 0);
    std::vector<std::string> result;
    for (const QByteArray& line : process.readAllStandardOutput().split('\n'))
        result.push_back(line.toStdString());
    return result;
}

} // namespace

TEST(TheDesigner, SpeaksGermanToGermans) {
    EXPECT_THAT(saidIn("de_AT.UTF-8"),
                ElementsAre(HasSubstr("Tabelle"), "Optionen", "Abbrechen", HasSubstr("Tabelle")));
}

TEST(TheDesigner, SpeaksFrenchAndSpanish) {
    EXPECT_THAT(saidIn("fr_FR.UTF-8"),
                ElementsAre(HasSubstr("table"), "Options", "Annuler", HasSubstr("Table")));
    EXPECT_THAT(saidIn("es_MX.UTF-8"),
                ElementsAre(HasSubstr("tabla"), "Opciones", "Cancelar", HasSubstr("Tabla")));
}

TEST(TheDesigner, SpeaksEnglishToEverybodyElse) {
    for (const char* language : {"en_GB.UTF-8", "it_IT.UTF-8", "C.UTF-8"})
        EXPECT_THAT(saidIn(QString::fromLatin1(language)),
                    ElementsAre("Add a table to begin: the statement appears here.", "Options",
                                "Cancel", "Left Table:"))
            << language;
}

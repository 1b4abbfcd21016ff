#include "designer/document/paths.h"
#include "designer/run/CsvWriter.h"
#include "designer/run/JsonWriter.h"
#include "designer/shell/Task.h"
#include "designer/shell/Words.h"
#include "designer/shell/loadForTask.h"
#include "designer/shell/openForTask.h"
#include "designer/statement/ModelWords.h"

#include <Zandor/QueryDocument.h>
#include <Zandor/reader/dialectOf.h>

#include <csignal>

namespace zandor::designer::shell {

namespace {

std::atomic<bool> stopWished = false;
static_assert(std::atomic<bool>::is_always_lock_free); // a signal sets it

extern "C" void wishStop(int signal) {
    stopWished = true;
    std::signal(signal, SIG_DFL); // a second one ends the program whatever it does
}

void heedSignals() {
    std::signal(SIGINT, wishStop);
    std::signal(SIGTERM, wishStop);
    // Whoever reads the rows has enough of them: an end without a word, as of any program in a
    // pipe. The parent may have turned that off.
    std::signal(SIGPIPE, SIG_DFL);
}

/// Gives the connection that is open already, and then others.
Connector connectorFrom(OpenedForTask opened) {
    const auto first =
        std::make_shared<std::optional<reader::Connection>>(std::move(opened.connection));
    const Connector others = Database::connectorTo(opened.address, opened.password);
    return [first, others]() -> reader::Result<reader::Connection> {
        if (!*first) return others();
        reader::Connection taken = std::move(**first);
        first->reset();
        return taken;
    };
}

/// What is wrong with the values for the parameters, or nothing.
std::optional<QString> complaint(const std::vector<Question>& questions, const Answers& values) {
    for (const Question& question : questions) {
        if (!values.contains(question.name))
            return Words::tr(R"(The query asks for "%1"; give it with --set "%1=VALUE".)")
                .arg(question.name);
        if (!fits(question, values[question.name]))
            return Words::tr(R"(The query asks for "%1", which has to be %2; "%3" is not.)")
                .arg(question.name, wanted(question), values[question.name]);
    }
    for (const QString& name : values.keys()) {
        const bool asked = std::any_of(questions.begin(), questions.end(),
                                       [&](const Question& each) { return each.name == name; });
        if (!asked)
            return Words::tr("The query does not ask for \"%1\"; leave out its --set.").arg(name);
    }
    return {};
}

int exitCode(const Outcome& outcome) {
    switch (outcome.end) {
    case Outcome::End::complete:
    case Outcome::End::limited: return allWell;
    case Outcome::End::cancelled: complain(Words::tr("Cancelled.")); return failed;
    case Outcome::End::failed:
    case Outcome::End::lost: complain(outcome.message); return failed;
    case Outcome::End::unreachable:
    case Outcome::End::refused: break;
    }
    complain(outcome.message);
    return unusable;
}

std::unique_ptr<Sink> makeWriter(Format format, files::Output& out) {
    if (format == Format::json) return std::make_unique<JsonWriter>(out);
    return std::make_unique<CsvWriter>(out);
}

} // namespace

int runQuery(const Task& task) {
    const auto document = loadForTask(task.query);
    if (!document) return complain(inWords(document.failure())), unusable;
    const QString address =
        task.database.isEmpty() ? QString::fromStdU16String(document->database) : task.database;
    if (address.isEmpty())
        return complain(Words::tr("The query names no database; give one with --database.")),
               unusable;
    heedSignals();
    auto opened = openForTask(address);
    if (!opened) return complain(inWords(opened.failure())), unusable;
    const auto dialect = reader::dialectOf(opened->connection.database());

    const auto text = statementFor(*document->query, dialect, task.limit);
    if (!text.runnable()) {
        for (const model::Finding& finding : text.findings)
            if (finding.isError()) complain(inWords(finding.message));
        return failed;
    }
    if (const auto wrong = complaint(questions(text), task.values))
        return complain(*wrong), unusable;

    files::Stream out = standardOutput();
    const auto command = makeCommand(text, dialect, task.values, task.limit);
    const auto writer = makeWriter(task.format, out);
    const Outcome outcome = fetch(connectorFrom(std::move(*opened)), command, *writer, stopWished);
    const auto unwritten = out.flush();
    const bool ended =
        outcome.end == Outcome::End::complete || outcome.end == Outcome::End::limited;
    if (unwritten && ended) return complain(*inWords(unwritten)), unusable;
    return exitCode(outcome);
}

} // namespace zandor::designer::shell

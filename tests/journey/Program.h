#pragma once

#include <QProcess>
#include <QStringList>

#include <functional>

/// How long anything may take before the test gives up, in milliseconds; a crowded machine is slow.
inline constexpr int patience = 30'000;

/// A program that ends with the object, or with this one if that dies.
class Program {
public:
    /// Throws std::runtime_error when it cannot be started.
    Program(const QString& path, const QStringList& arguments, const QStringList& environment = {});
    ~Program();

    /// Sends a line; throws when the program has ended.
    void send(const QString& line);
    /// The next line of its output. Throws std::runtime_error when none comes.
    QString line();
    /// Whether it has ended by itself with 0; waits for it.
    bool endsWell();
    /// Ends it at once, without a word to it.
    void kill();

private:
    QProcess mProcess;
};

/// Tries until it holds. Throws std::runtime_error, which names what was waited for, when it never
/// does.
void await(const QString& what, const std::function<bool()>& holds);

#pragma once

#include <cstddef>
#include <memory>
#include <string>

/// While it lives, one of the system's calls for the files of a folder fails: to open, look at,
/// read, write, flush, close, rename or delete one. Counts the calls of the thread that made it;
/// calls of other threads and for other files go their way. One at a time.
class FailingFiles {
public:
    enum class How {
        fails,      ///< the nth call, with an error of the device
        interrupts, ///< a signal comes at each place where one can be waited for, once
    };

    /// `nth` from 1; 0 has none fail. The folder is a path as the system resolves it.
    FailingFiles(std::string folder, std::size_t nth, How how = How::fails);
    FailingFiles(const FailingFiles&) = delete;
    FailingFiles& operator=(const FailingFiles&) = delete;
    ~FailingFiles();

    /// Of the calls so far.
    std::size_t calls() const;
    /// The name of the call that failed; empty when none has.
    std::string failed() const;

    struct Watch;

private:
    const std::unique_ptr<Watch> mWatch;
};

#include "must.h"

#include "control_on_headless/RandomUser.h"

#include <algorithm>

namespace {

/// A control takes its time to begin, so that few long inputs tell less than many short ones.
constexpr int mostSteps = 60;

/// Numbers out of bytes; zeros once there are none left.
class Bytes {
public:
    Bytes(const std::uint8_t* data, std::size_t size) : mAt(data), mEnd(data + size) {}

    bool done() const { return mAt == mEnd; }
    std::uint64_t draw(std::uint64_t span) {
        std::uint64_t number = 0;
        for (std::uint64_t reach = 1; reach < span && !done(); reach *= 256)
            number = number * 256 + *mAt++;
        return number % span;
    }

private:
    const std::uint8_t* mAt;
    const std::uint8_t* mEnd;
};

} // namespace

/// Whatever a user and a host do, and whatever a model answers, lists, joins, grid and model agree
/// between any two acts, and nothing outlives the control. The first byte says whether the model
/// fails now and then.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    Bytes bytes(data, size);
    fake::Library library;
    RandomUser user([&bytes](std::uint64_t span) { return bytes.draw(span); }, library);
    const bool fails = bytes.draw(2) != 0;
    user.open();
    if (fails) user.haveModelsFail();
    for (int step = 0; step < mostSteps && !bytes.done(); ++step) {
        user.act();
        const std::string broken = user.broken();
        must(broken.empty(), "after " + user.last() + ": " + broken);
    }
    const std::string survivors = user.close();
    must(survivors.empty(), survivors);
    return 0;
}

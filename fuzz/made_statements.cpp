#include "statement_grammar.h"

#include <cstdint>
#include <cstdio>
#include <cstdlib>

// Gives statements of a grammar to the fuzzer's function: the same ones in every run, so that a
// build fails on them only by what was changed. Other seeds are for whoever looks for more.

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size);

int main(int count, char** arguments) {
    if (count != 3) {
        std::fprintf(stderr,
                     "Say the seed of the first statement and how many there are: %s 20000 5000\n",
                     arguments[0]);
        return 2;
    }
    const unsigned long first = std::strtoul(arguments[1], nullptr, 10);
    const unsigned long statements = std::strtoul(arguments[2], nullptr, 10);
    for (unsigned long seed = first; seed < first + statements; ++seed) {
        std::minstd_rand random(static_cast<std::minstd_rand::result_type>(seed));
        random.discard(5); // the first ones of seeds beside each other are alike
        const std::string text = '0' + randomStatement(random);
        LLVMFuzzerTestOneInput(reinterpret_cast<const std::uint8_t*>(text.data()), text.size());
    }
    std::printf("%lu statements from seed %lu on\n", statements, first);
}

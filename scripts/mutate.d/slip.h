// Which slip is made in this process. With a negative number none is, and each that could have been
// made is written down.
#pragma once

#include <cstdio>
#include <cstdlib>

inline void zandorReached(int number) {
    constexpr int places = 16384; // more than there are slips
    static int seen[places];
    int at = number % places;
    while (seen[at] != 0 && seen[at] != number) at = (at + 1) % places;
    if (seen[at] == number) return;
    seen[at] = number;
    if (std::FILE* list = std::fopen(std::getenv("ZANDOR_REACHED"), "a")) {
        std::fprintf(list, "%d\n", number);
        std::fclose(list);
    }
}

inline bool zandorSlip(int number) {
    static const int chosen = [] {
        const char* text = std::getenv("ZANDOR_SLIP");
        return text ? std::atoi(text) : 0;
    }();
    if (chosen < 0) zandorReached(number);
    return number == chosen;
}

#include "frontends/qt/EntryTexts.h"

#include <algorithm>
#include <cstring>

namespace zandor::platform::qt {

namespace {

constexpr char16_t lastNarrow = 0xFF;

char16_t letter(char byte) { return static_cast<unsigned char>(byte); }

} // namespace

String EntryTexts::text(int row) const {
    return unpacked(begin(row), ends(row).text, ends(row).textIsWide != 0);
}

String EntryTexts::key(int row) const {
    const Ends& at = ends(row);
    return at.keyIsText != 0 ? text(row) : unpacked(at.text, at.key, at.keyIsWide != 0);
}

String EntryTexts::unpacked(std::size_t from, std::size_t to, bool wide) const {
    String text(wide ? (to - from) / sizeof(char16_t) : to - from, u'\0');
    if (wide)
        std::memcpy(text.data(), mBytes.data() + from, to - from);
    else
        std::transform(mBytes.data() + from, mBytes.data() + to, text.data(), letter);
    return text;
}

bool EntryTexts::reads(int row, StringView text) const {
    const char* const bytes = mBytes.data() + begin(row);
    const std::size_t size = ends(row).text - begin(row);
    if (ends(row).textIsWide != 0)
        return size == text.size() * sizeof(char16_t) && std::memcmp(bytes, text.data(), size) == 0;
    return size == text.size() &&
           std::equal(text.begin(), text.end(), bytes,
                      [](char16_t sought, char byte) { return sought == letter(byte); });
}

/// Whether it takes two bytes a letter.
bool EntryTexts::append(StringView text) {
    const bool wide =
        std::any_of(text.begin(), text.end(), [](char16_t c) { return c > lastNarrow; });
    const std::size_t at = mBytes.size();
    mBytes.resize(at + text.size() * (wide ? sizeof(char16_t) : 1));
    if (wide)
        std::memcpy(mBytes.data() + at, text.data(), text.size() * sizeof(char16_t));
    else
        std::transform(text.begin(), text.end(), mBytes.data() + at,
                       [](char16_t c) { return static_cast<char>(c); });
    return wide;
}

void EntryTexts::add(StringView key, StringView text) {
    // What an attempt that failed has left goes.
    mBytes.resize(begin(count()));
    Ends at{};
    at.textIsWide = append(text);
    at.text = static_cast<std::uint32_t>(mBytes.size()) & 0x3FFFFFFFU;
    at.keyIsText = key == text;
    at.keyIsWide = at.keyIsText == 0 && append(key);
    at.key = static_cast<std::uint32_t>(mBytes.size()) & 0x7FFFFFFFU;
    mEnds.push_back(at);
}

void EntryTexts::squeeze() {
    mBytes.shrink_to_fit();
    mEnds.shrink_to_fit();
}

} // namespace zandor::platform::qt

#include "model/files/Refusal.h"

namespace zandor::files {

Pointer Pointer::operator/(std::string_view name) const {
    Pointer result;
    result.mText = mText + '/';
    for (const char c : files::shown(name)) {
        if (c == '~')
            result.mText += "~0";
        else if (c == '/')
            result.mText += "~1";
        else
            result.mText += c;
    }
    return result;
}

model::MessageArgument Pointer::shown() const {
    constexpr std::size_t most = 150;
    constexpr std::size_t end = 50;
    if (mText.empty()) return model::say<MessageCode::theFile>();
    if (mText.size() <= most) return {mText};
    return {mText.substr(0, most - end) + "..." + mText.substr(mText.size() - end)};
}

std::string shown(std::string_view text) {
    constexpr std::size_t most = 40;
    std::string result;
    for (const char c : text) {
        if (result.size() == most) return result + "...";
        result += c >= 0x20 && c < 0x7f ? c : '?';
    }
    return result;
}

std::string nameOf(const Path& path) {
    std::string name = path.string();
    for (char& c : name)
        if (static_cast<unsigned char>(c) < 0x20 || c == 0x7f) c = '?';
    return name;
}

} // namespace zandor::files

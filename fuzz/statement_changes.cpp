#include <cctype>
#include <cstdint>
#include <cstring>
#include <random>
#include <string>
#include <string_view>
#include <vector>

// Changes statements by tokens, so that many of them still parse; else by bytes.

extern "C" std::size_t LLVMFuzzerMutate(std::uint8_t* data, std::size_t size, std::size_t most);

namespace {

using Tokens = std::vector<std::string>;

bool isWord(char c) { return std::isalnum(static_cast<unsigned char>(c)) != 0 || c == '_'; }

/// The first token of a text that is not empty.
std::string_view tokenOf(std::string_view text) {
    std::size_t end = 1;
    const char first = text.front();
    if (first == '\'' || first == '"') {
        end = text.find(first, 1);
        return text.substr(0, end == std::string_view::npos ? end : end + 1);
    }
    if (isWord(first))
        while (end < text.size() && (isWord(text[end]) || text[end] == '.')) ++end;
    if (std::strchr("<>=|!-", first) && end < text.size() && std::strchr("<>=|-", text[end])) ++end;
    return text.substr(0, end);
}

Tokens tokensOf(std::string_view text) {
    Tokens tokens;
    while (!text.empty()) {
        const std::string_view token = tokenOf(text);
        if (!std::isspace(static_cast<unsigned char>(token.front()))) tokens.emplace_back(token);
        text.remove_prefix(token.size());
    }
    return tokens;
}

class Changer {
public:
    explicit Changer(unsigned seed) : mRandom(seed) {}

    bool often() { return below(10) != 0; }

    void change(Tokens& tokens, const Tokens& others) {
        for (std::size_t n = below(4) + 1; n > 0; --n) once(tokens, others);
    }

private:
    std::size_t below(std::size_t limit) { return limit == 0 ? 0 : mRandom() % limit; }

    /// A place, and how many tokens from there on: those of parentheses, or some.
    std::pair<std::size_t, std::size_t> part(const Tokens& tokens) {
        const std::size_t begin = below(tokens.size());
        std::size_t end = begin;
        int depth = 0;
        const std::size_t few = begin + below(6);
        for (; end < tokens.size(); ++end) {
            if (tokens[end] == "(") ++depth;
            if (tokens[end] == ")" && --depth < 0) break;
            if (depth == 0 && end >= few) {
                ++end;
                break;
            }
        }
        return {begin, std::max(end, begin + 1) - begin};
    }

    void once(Tokens& tokens, const Tokens& others) {
        if (tokens.empty()) return;
        const auto [begin, count] = part(tokens);
        const auto first = tokens.begin() + static_cast<std::ptrdiff_t>(begin);
        const auto last = first + static_cast<std::ptrdiff_t>(count);
        switch (below(6)) {
        case 0: tokens.erase(first, last); break;
        case 1: {
            const Tokens again(first, last);
            tokens.insert(last, again.begin(), again.end());
            break;
        }
        case 2: tokens[begin] = tokens[below(tokens.size())]; break;
        case 3: tokens[begin] = word(); break;
        case 4: tokens.insert(first, word()); break;
        default: {
            const Tokens& from = others.empty() ? tokens : others;
            const auto [start, length] = part(from);
            const Tokens piece(from.begin() + static_cast<std::ptrdiff_t>(start),
                               from.begin() + static_cast<std::ptrdiff_t>(start + length));
            const auto at = tokens.erase(first, last);
            tokens.insert(at, piece.begin(), piece.end());
        }
        }
    }

    std::string word() {
        static const Tokens words = tokensOf(
            "id name city credit active since customer_id placed total order_id number quantity "
            "price customers orders lines c o l c.id o.customer_id o.id l.order_id "
            "AND OR NOT = <> < >= IS NULL IN ( ) BETWEEN LIKE '%a%' 'Wien' '' '2020-01-01' 0 1 2 -1 "
            "2.5 NULL TRUE CASE WHEN THEN ELSE END + - * / || , DISTINCT JOIN LEFT RIGHT FULL ON "
            "USING GROUP BY HAVING ORDER DESC LIMIT count sum min max avg coalesce nullif abs "
            "length substr upper trim round date strftime");
        return words[below(words.size())];
    }

    std::minstd_rand mRandom;
};

std::size_t put(const Tokens& tokens, char dialect, std::uint8_t* data, std::size_t most) {
    std::string text(1, dialect);
    for (const std::string& token : tokens) text += token + ' ';
    const std::size_t size = std::min(text.size(), most);
    std::memcpy(data, text.data(), size);
    return size;
}

std::string_view statementOf(const std::uint8_t* data, std::size_t size) {
    if (size < 2) return {};
    return {reinterpret_cast<const char*>(data + 1), size - 1};
}

} // namespace

extern "C" std::size_t LLVMFuzzerCustomMutator(std::uint8_t* data, std::size_t size,
                                               std::size_t most, unsigned seed) {
    Changer changer(seed);
    Tokens tokens = tokensOf(statementOf(data, size));
    if (tokens.empty() || !changer.often()) return LLVMFuzzerMutate(data, size, most);
    changer.change(tokens, {});
    return put(tokens, static_cast<char>(data[0]), data, most);
}

extern "C" std::size_t LLVMFuzzerCustomCrossOver(const std::uint8_t* one, std::size_t oneSize,
                                                 const std::uint8_t* other, std::size_t otherSize,
                                                 std::uint8_t* out, std::size_t most,
                                                 unsigned seed) {
    Changer changer(seed);
    Tokens tokens = tokensOf(statementOf(one, oneSize));
    changer.change(tokens, tokensOf(statementOf(other, otherSize)));
    return put(tokens, oneSize > 0 ? static_cast<char>(one[0]) : '0', out, most);
}

#include "model/sql_reader/Comments.h"

#include <Zandor/model/Names.h>

#include <algorithm>
#include <array>

namespace zandor::sql_reader {

using model::CommentPlace;
using model::sql::Remark;

namespace {

class CommentPlaces {
public:
    CommentPlaces(std::size_t byte, const ParserText& text, const Commented& commented)
        : mText(text), mCommented(commented), mSelect(selectAround(byte)) {}

    std::vector<Remark> all() const {
        std::vector<Remark> remarks;
        for (const auto& comment : mText.comments)
            if (selectAround(comment.byte) == mSelect) remarks.push_back(remarkOf(comment));
        return remarks;
    }

private:
    using Parentheses = ParserText::Parentheses;

    Remark remarkOf(const ParserText::Comment& comment) const {
        if (comment.beside) return {begunBefore(behindComma(comment.byte)), true, comment.text};
        return {standsBefore(comment.byte), false, comment.text};
    }

    decltype(Remark::by) standsBefore(std::size_t byte) const {
        if (const auto within = callAround(byte)) return begunBefore(within->begin);
        const auto next = std::lower_bound(
            mText.origins.begin(), mText.origins.end(), byte,
            [](const ParserText::Origin& each, std::size_t sought) { return each.byte < sought; });
        if (next == mText.origins.end() || (mSelect && next->byte >= mSelect->end))
            return CommentPlace::end;
        const auto last = tokenBefore(byte);
        if (last && !separates(*last) && !separates(next->byte)) return begunBefore(byte);
        const auto by = mCommented.lower_bound(next->byte);
        return by == mCommented.end() ? CommentPlace::end
               : mCommented.begin() == by && !last ? CommentPlace::start
                                                   : by->second;
    }

    /// The newest that has begun before a byte.
    decltype(Remark::by) begunBefore(std::size_t byte) const {
        const auto behind = mCommented.lower_bound(byte);
        return behind == mCommented.begin() ? CommentPlace::start : std::prev(behind)->second;
    }

    /// The end of the last token before a byte that is no comma.
    std::size_t behindComma(std::size_t byte) const {
        auto token = tokenBefore(byte);
        while (token && mText.text[*token] == ',') token = tokenBefore(*token);
        return token ? *token + 1 : 0;
    }

    /// Where the token before a byte begins; nothing at the beginning of the select.
    std::optional<std::size_t> tokenBefore(std::size_t byte) const {
        const auto behind = std::lower_bound(
            mText.origins.begin(), mText.origins.end(), byte,
            [](const ParserText::Origin& each, std::size_t sought) { return each.byte < sought; });
        if (behind == mText.origins.begin()) return {};
        const std::size_t token = std::prev(behind)->byte;
        if (mSelect && token <= mSelect->begin) return {};
        return token;
    }

    /// Whether a token stands between what comments can stand by.
    bool separates(std::size_t token) const {
        constexpr auto words = std::to_array<std::string_view>(
            {"all",    "and",   "by",     "cross",   "distinct", "fetch", "from",  "full",
             "group",  "having", "inner", "join",    "left",     "limit", "natural", "not",
             "offset", "on",    "or",     "order",   "right",    "select", "union", "where"});
        const char c = mText.text[token];
        if (c == ',' || c == '(' || c == ')' || c == ';') return true;
        return std::find(words.begin(), words.end(), wordAt(token)) != words.end();
    }

    /// In small letters.
    std::string wordAt(std::size_t byte) const {
        std::string word;
        for (; byte < mText.text.size(); ++byte) {
            const char c = mText.text[byte];
            if ((c < 'a' || c > 'z') && (c < 'A' || c > 'Z')) break;
            word += static_cast<char>(c | 0x20);
        }
        return word;
    }

    bool isSelect(const Parentheses& each) const {
        std::size_t first = each.begin + 1;
        while (first < mText.text.size() && std::string_view(" \n(").find(mText.text[first]) !=
                                                std::string_view::npos)
            ++first;
        const std::string word = wordAt(first);
        return word == "select" || word == "with";
    }

    const Parentheses* innermost(std::size_t byte, const auto& isMeant) const {
        const Parentheses* found = nullptr;
        for (const Parentheses& each : mText.parentheses)
            if (each.begin < byte && byte <= each.end && isMeant(each)) found = &each;
        return found;
    }

    const Parentheses* selectAround(std::size_t byte) const {
        return innermost(byte, [this](const Parentheses& each) { return isSelect(each); });
    }

    /// The parentheses behind a name within the select: of a function, or a list of values.
    const Parentheses* callAround(std::size_t byte) const {
        return innermost(byte, [this](const Parentheses& each) {
            if (isSelect(each) || (mSelect && each.begin <= mSelect->begin)) return false;
            const auto before = tokenBefore(each.begin);
            return before && !separates(*before);
        });
    }

    const ParserText& mText;
    const Commented& mCommented;
    const Parentheses* const mSelect; ///< nothing: the outermost
};

} // namespace

std::vector<Remark> commentsAround(std::size_t byte, const ParserText& text,
                                   const Commented& commented) {
    if (text.comments.empty()) return {};
    return CommentPlaces(byte, text, commented).all();
}

} // namespace zandor::sql_reader

#include "model/criteria/NameReader.h"

#include <Zandor/model/Table.h>

#include <algorithm>

namespace zandor::model::criteria {

using sql::Node;

namespace {

std::optional<sql::ColumnRef> columnOf(const Reference& known) {
    if (known.column.empty()) return {};
    const auto column = known.column.column();
    if (!column) throw Error{known.begin, say<MessageCode::tableOfColumnGone>()};
    return columnRef(*column, *known.column.table().table());
}

} // namespace

Node NameReader::takeQualified(bool mayBeText) {
    const Token first = mCursor.peek();
    if (first.kind != TokenKind::word && first.kind != TokenKind::bracketed) return {};
    if (mCursor.peek(1).kind == TokenKind::dot) {
        mCursor.take();
        mCursor.take();
        const Token second = mCursor.take();
        if (second.kind != TokenKind::bracketed && second.kind != TokenKind::word)
            throw Error{second.begin, say<MessageCode::columnNameMissing>()};
        const auto found = lookUp({first.begin, first.end}, first.text, second.text);
        if (!found)
            throw Error{first.begin,
                        say<MessageCode::noSuchColumn>(first.text + u"." + second.text)};
        return sql::make(*found);
    }
    if (first.kind != TokenKind::word) return {};
    const StringView whole = first.text;
    const std::size_t dot = whole.find(u'.');
    if (dot == StringView::npos || !isBareName(whole.substr(0, dot)) ||
        !isBareName(whole.substr(dot + 1)))
        return {};
    Reference reference{first.begin, first.begin + dot};
    const auto found = lookUp(reference, whole.substr(0, dot), whole.substr(dot + 1));
    if (!found) {
        if (mayBeText) references.push_back(std::move(reference));
        return {};
    }
    mCursor.take();
    return sql::make(*found);
}

Node NameReader::takeBracketed() {
    const Token token = mCursor.take();
    if (const auto column = lookUpAlone(token)) return sql::make(*column);
    if (references.empty() || references.back().begin != token.begin)
        references.push_back({token.begin, token.begin});
    return sql::make(sql::Parameter{token.text});
}

Node NameReader::takeBare() {
    const Token token = mCursor.peek();
    if (token.kind != TokenKind::word || !isBareName(token.text)) return {};
    const auto column = lookUpAlone(token);
    if (!column) return {};
    mCursor.take();
    return sql::make(*column);
}

Node NameReader::takeParameter(bool mayBeText) {
    const Token& token = mCursor.peek();
    if (token.kind != TokenKind::word || token.text.front() != u':') return {};
    String name = token.text.substr(1);
    if (!isBareName(name)) {
        if (mayBeText) return {};
        throw Error{token.begin + 1, say<MessageCode::parameterNameMissing>()};
    }
    mCursor.take();
    return sql::make(sql::Parameter{std::move(name)});
}

std::optional<sql::ColumnRef> NameReader::lookUpAlone(const Token& token) {
    if (const Reference* known = knownAt(token.begin)) {
        references.push_back(*known);
        return columnOf(*known);
    }
    const auto found = mResolver.columnsNamed(token.text);
    if (found.size() > 1)
        throw Error{token.begin,
                    say<MessageCode::ambiguousColumn>(u"[" + found.front().column.table + u"].[" +
                                                      token.text + u"]")};
    if (found.empty()) return {};
    references.push_back({token.begin, token.begin, found.front().place});
    return found.front().column;
}

std::optional<sql::ColumnRef> NameReader::lookUp(Reference reference, StringView table,
                                                 StringView column) {
    if (const Reference* known = knownAt(reference.begin)) {
        // A settled text is entered by the caller.
        if (known->column.empty()) return {};
        references.push_back(*known);
        return columnOf(*known);
    }
    const auto found = mResolver.columnsNamed(table, column);
    if (found.size() != 1) return {};
    reference.column = found.front().place;
    references.push_back(std::move(reference));
    return found.front().column;
}

const Reference* NameReader::knownAt(std::size_t begin) const {
    const auto at = std::find_if(mKnown.begin(), mKnown.end(),
                                 [&](const Reference& known) { return known.begin == begin; });
    return at == mKnown.end() ? nullptr : &*at;
}

void NameReader::keepKnown() {
    for (const Reference& known : mKnown)
        if (references.empty() || known.begin > references.back().begin)
            references.push_back(known);
}

} // namespace zandor::model::criteria

#include "model/criteria/Signatures.h"

#include <Zandor/model/Names.h>

#include <algorithm>
#include <array>

namespace zandor::model::criteria {

namespace {

constexpr std::size_t anyNumber = 100;

const std::vector<Signature>& signatures() {
    using A = Argument;
    using F = sql::Function;
    using G = Given;
    static const std::vector<Signature> all = {
        {{u"Round", u"Round(number) or Round(number, decimals)"},
         F::round,
         G::sameNumber,
         1,
         2,
         {A::number, A::digits}},
        {{u"Abs", u"Abs(number)"}, F::abs, G::sameNumber, 1, 1, {A::number}},
        {{u"Length", u"Length(text)"}, F::length, G::whole, 1, 1, {A::text}},
        {{u"Upper", u"Upper(text)"}, F::upper, G::text, 1, 1, {A::text}},
        {{u"Lower", u"Lower(text)"}, F::lower, G::text, 1, 1, {A::text}},
        {{u"Trim", u"Trim(text)"}, F::trim, G::text, 1, 1, {A::text}},
        {{u"Left", u"Left(text, characters)"}, F::left, G::text, 2, 2, {A::text, A::whole}},
        {{u"Right", u"Right(text, characters)"}, F::right, G::text, 2, 2, {A::text, A::whole}},
        {{u"Mid", u"Mid(text, first) or Mid(text, first, characters)"},
         F::mid,
         G::text,
         2,
         3,
         {A::text, A::whole, A::whole}},
        {{u"Coalesce", u"Coalesce(value, otherwise)"},
         F::coalesce,
         G::first,
         2,
         anyNumber,
         {A::any, A::any}},
        {{u"Year", u"Year(date)"}, F::year, G::whole, 1, 1, {A::date}},
        {{u"Month", u"Month(date)"}, F::month, G::whole, 1, 1, {A::date}},
        {{u"Day", u"Day(date)"}, F::day, G::whole, 1, 1, {A::date}},
        {{u"DateDiff", u"DateDiff(from, to)"}, F::dateDiff, G::whole, 2, 2, {A::date, A::date}},
        {{u"Today", u"Today()"}, F::today, G::date, 0, 0, {}},
        {{u"Now", u"Now()"}, F::now, G::timestamp, 0, 0, {}},
        {{u"Text", u"Text(value)"}, F::text, G::text, 1, 1, {A::text}},
        {{u"Number", u"Number(value)"}, F::number, G::number, 1, 1, {A::any}},
        {{u"Date", u"Date(value)"}, F::date, G::date, 1, 1, {A::any}},
    };
    return all;
}

} // namespace

const Signature* signatureOf(StringView name) {
    const auto& all = signatures();
    const auto at = std::find_if(all.begin(), all.end(), [&](const Signature& signature) {
        return sameName(signature.words.name, name);
    });
    return at == all.end() ? nullptr : &*at;
}

const Signature* signatureOf(sql::Function function) {
    const auto& all = signatures();
    const auto at = std::find_if(all.begin(), all.end(), [&](const Signature& signature) {
        return signature.function == function;
    });
    return at == all.end() ? nullptr : &*at;
}

bool isTotalName(StringView name) {
    constexpr std::array<StringView, 7> names = {u"Sum", u"Count", u"Avg",  u"Average",
                                                 u"Min", u"Max",   u"Total"};
    return std::any_of(names.begin(), names.end(),
                       [&](StringView each) { return sameName(each, name); });
}

std::span<const FunctionName> functions() {
    static const std::vector<FunctionName> all = [] {
        std::vector<FunctionName> names = {{u"If", u"If(condition, then, otherwise)"}};
        for (const Signature& signature : signatures()) names.push_back(signature.words);
        return names;
    }();
    return all;
}

} // namespace zandor::model::criteria

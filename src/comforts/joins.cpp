#include "comforts/Door.h"
#include "comforts/filled.h"

#include <Zandor/control/symbols.h>

#include <Zandor/comforts/Comforts.h>

// Joins that can be read.

namespace zandor::comforts {

using platform::String;
using TalvikDBxZandor::PlacedJoin;

namespace {

constexpr std::int32_t leftOuter = 1;
constexpr std::int32_t rightOuter = 2;
constexpr std::int32_t bothOuter = 3;

bool keepsLeft(std::int32_t type) { return type == leftOuter || type == bothOuter; }
bool keepsRight(std::int32_t type) { return type == rightOuter || type == bothOuter; }

/// Empty for "=" and for a code that there is none of.
platform::StringView unusualOperator(std::int32_t code) {
    const auto& symbols = TalvikDBxZandor::operatorSymbols;
    return code > 0 && static_cast<std::size_t>(code) < symbols.size()
               ? symbols[static_cast<std::size_t>(code)]
               : platform::StringView();
}

/// An operator as it reads from the other side.
platform::StringView turned(platform::StringView symbol) {
    if (symbol == u"<") return u">";
    if (symbol == u">") return u"<";
    if (symbol == u"<=") return u">=";
    if (symbol == u">=") return u"<=";
    return symbol;
}

} // namespace

String Comforts::sentenceOf(const PlacedJoin& join) const {
    const bool right = keepsRight(join.JoinType) && !keepsLeft(join.JoinType);
    const String& pattern = join.JoinType == bothOuter          ? mWords.AllOfBoth
                            : keepsLeft(join.JoinType) || right ? mWords.AllOfOne
                                                                : mWords.Matching;
    String sentence = right ? filled(pattern, {join.RightTable, join.LeftTable})
                            : filled(pattern, {join.LeftTable, join.RightTable});
    const auto symbol = unusualOperator(join.CompareOperator);
    if (symbol.empty()) return sentence;
    sentence += u": " + join.LeftTable + u"." + join.LeftColumn + u" ";
    sentence += symbol;
    return sentence + u" " + join.RightTable + u"." + join.RightColumn;
}

platform::LineNotes Comforts::notesOf(const PlacedJoin& join) const {
    const bool keepsWest = join.LeftIsWest ? keepsLeft(join.JoinType) : keepsRight(join.JoinType);
    const bool keepsEast = join.LeftIsWest ? keepsRight(join.JoinType) : keepsLeft(join.JoinType);
    const auto symbol = unusualOperator(join.CompareOperator);
    return {.First = keepsWest ? mWords.All : String(),
            .Middle = String(join.LeftIsWest ? symbol : turned(symbol)),
            .Second = keepsEast ? mWords.All : String(),
            .Sentence = sentenceOf(join)};
}

String Comforts::spokenName(const platform::Line& line) {
    const auto door = mDoor; // which the model's code may end
    return door && door->isOpen() ? door->nameOf(line) : String();
}

/// Only while it has something to say, so that placing joins costs nothing else.
void Comforts::readJoins(bool now) {
    if (!mDoor) return;
    act(u"readJoins", [&](Door& door) {
        if (now)
            door.listenToJoins([this](const PlacedJoin& join, platform::Line& line) {
                line.Notes(notesOf(join));
            });
        else
            door.listenToJoins([](const PlacedJoin&, platform::Line& line) { line.Notes({}); });
        door.drawJoins();
        if (!now && door.isOpen()) door.listenToJoins({});
        return true;
    });
}

} // namespace zandor::comforts

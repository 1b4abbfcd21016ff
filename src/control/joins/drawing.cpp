#include <Zandor/Zandor.h>

#include <Zandor/platform/Numbers.h>

#include <bit>
#include <cmath>

namespace TalvikDBxZandor {

using platform::single;

namespace {

constexpr float connectorSize = 140;
constexpr float hitTolerance = 50;
constexpr std::int32_t leftOuter = 1;

/// The top of a mark beside a row whose middle is at `rowMiddle`: level with the row, but never
/// outside the table's frame, so that the mark of a row scrolled out of view stays at its edge.
float clampedTop(float rowMiddle, float markHeight, const platform::Bounds& box) {
    const float half = markHeight / 2;
    if (box.Top >= single(rowMiddle - half)) return box.Top;
    const float tableBottom = single(box.Top + box.Height);
    if (tableBottom <= single(rowMiddle + half)) return single(tableBottom - markHeight);
    return single(rowMiddle - half);
}

struct LineEnds {
    float X1, Y1, X2, Y2;
};

/// From mark to mark, with the edges of the tables that they stand beside.
LineEnds lineBetween(float west, const platform::Bounds& markA, float east,
                     const platform::Bounds& markB) {
    return {single(west + markA.Width), single(markA.Top + markA.Height / 2),
            single(east - markB.Width), single(markB.Top + markB.Height / 2)};
}

/// Error 91 for a table list that there is none of.
const TalvikTabulet::Tabulet& found(const TalvikTabulet::Tabulet* table) {
    if (!table) throw platform::errors::objectNotSet();
    return *table;
}

void sizeMark(platform::Shape& mark) {
    const platform::Bounds before = mark.bounds();
    mark.setBounds({before.Left, before.Top, connectorSize, connectorSize});
}

/// Its left edge is in place even where its top cannot be told.
void placeMark(platform::Shape& mark, float left, float rowMiddle,
               const TalvikTabulet::Tabulet& table) {
    platform::Bounds place{left, mark.Top(), connectorSize, connectorSize};
    try {
        place.Top = clampedTop(rowMiddle, connectorSize, table.bounds());
    } catch (...) {
        mark.setBounds(place);
        throw;
    }
    mark.setBounds(place);
}

} // namespace

bool Zandor::DrawJoin(clsJoinLine& JoinLine) {
    bool result = false;
    Guard(u"DrawJoin", [&] {
        PlaceJoin(JoinLine);
        result = true;
    });
    return result;
}

/// Looks the ends up by handle and name: each is the last entry of its name.
void Zandor::FindEnds(clsJoinLine& JoinLine) {
    JoinLine.LeftEnd = JoinLine.RightEnd = {};
    DrawnEnd leftEnd, rightEnd;
    for (const auto& [index, table] : lstTable) {
        if (index == 0) continue;
        const bool left = table->TableHandle() == JoinLine.LeftTablehwnd();
        if (!left && table->TableHandle() != JoinLine.RightTablehwnd()) continue;
        DrawnEnd& end = left ? leftEnd : rightEnd;
        const auto& entries = table->ColumnItems();
        end.Slot = index;
        end.Count = entries.Count();
        const platform::StringView name = left ? JoinLine.LeftColumn() : JoinLine.RightColumn();
        for (std::int32_t n = 1; n <= end.Count; ++n)
            if (entries.Reads(n, name)) end.Position = n;
        if (end.Position > 0) end.Item = entries.Item(end.Position);
    }
    JoinLine.LeftEnd = leftEnd;
    JoinLine.RightEnd = rightEnd;
}

/// The table list of an end that is where it was found; nothing where it must be looked for. Lists
/// only grow, or lose all their entries.
TalvikTabulet::Tabulet* Zandor::TableAt(const DrawnEnd& end, std::int32_t handle) const {
    Tabulet* const table = end.Item ? lstTable.Peek(end.Slot) : nullptr;
    if (!table || table->TableHandle() != handle) return nullptr;
    const auto& entries = table->ColumnItems();
    const bool same = entries.Count() == end.Count && entries.IsAt(end.Position, *end.Item);
    return same ? table : nullptr;
}

/// The one place that line ends are set in, so that what the search for a line goes by is theirs.
platform::Line& Zandor::PlaceLine(clsJoinLine& JoinLine, float X1, float Y1, float X2, float Y2) {
    const std::int16_t number = JoinLine.Index();
    try {
        platform::Line& line = *linJoin(JoinLine.JoinLineIndex());
        line.setEnds(X1, Y1, X2, Y2);
        mReaches.place(number, X1, Y1, X2, Y2, hitTolerance);
        return line;
    } catch (...) {
        mReaches.forget(number);
        throw;
    }
}

// Nothing on this way reaches the host, the hook included, so it holds nothing: it runs for each
// join of a table at each step of its move.
void Zandor::PlaceJoin(clsJoinLine& JoinLine) {
    const DrawnEnd& left = JoinLine.LeftEnd;
    const DrawnEnd& right = JoinLine.RightEnd;
    JoinLine.Drawn = {};
    Tabulet* leftList = TableAt(left, JoinLine.LeftTablehwnd());
    Tabulet* rightList = leftList ? TableAt(right, JoinLine.RightTablehwnd()) : nullptr;
    if (!rightList) {
        FindEnds(JoinLine);
        leftList = left.Slot == 0 ? nullptr : lstTable.Peek(left.Slot);
        rightList = right.Slot == 0 ? nullptr : lstTable.Peek(right.Slot);
    }

    platform::Shape& markA = *shpJoin(JoinLine.LeftConnectorIndex());
    platform::Shape& markB = *shpJoin(JoinLine.RightConnectorIndex());
    markA.ShapeStyle(platform::shapeSquare); // takes the circle of an earlier type back
    markB.ShapeStyle(platform::shapeSquare);
    sizeMark(markA);
    sizeMark(markB);

    const Tabulet& rightTable = found(rightList);
    const Tabulet& leftTable = found(leftList);
    const bool leftIsWest = rightTable.Left() > leftTable.Left();
    const Tabulet& west = leftIsWest ? leftTable : rightTable;
    const Tabulet& east = leftIsWest ? rightTable : leftTable;
    const auto westPoint = (leftIsWest ? left : right).Item->RightEdgePoint();
    const auto eastPoint = (leftIsWest ? right : left).Item->LeftEdgePoint();

    placeMark(markA, westPoint.X, westPoint.Y, west);
    placeMark(markB, single(eastPoint.X - connectorSize), eastPoint.Y, east);

    // The circle stands at the eastern end whichever side of the join that is; only with both
    // tables at the same place does it stand at the western one.
    if (JoinLine.JoinType() == leftOuter)
        (east.Left() > west.Left() ? markB : markA).ShapeStyle(platform::shapeCircle);

    const platform::Bounds placeA = markA.bounds();
    const platform::Bounds placeB = markB.bounds();
    const LineEnds ends = lineBetween(westPoint.X, placeA, eastPoint.X, placeB);
    platform::Line& line = PlaceLine(JoinLine, ends.X1, ends.Y1, ends.X2, ends.Y2);
    if (const auto& placed = mHooks.JoinPlaced)
        placed({.LeftTable = leftTable.Text(),
                .LeftColumn = left.Item->Text(),
                .RightTable = rightTable.Text(),
                .RightColumn = right.Item->Text(),
                .JoinType = JoinLine.JoinType(),
                .CompareOperator = JoinLine.CompareOperator(),
                .LeftIsWest = leftIsWest},
               line);
    line.Visible(true);
    markA.Visible(true);
    markB.Visible(true);
    JoinLine.Drawn = leftIsWest;
}

/// A join at a step of the move of one of its tables: marks and line are there and only come to
/// other places, until the tables change sides.
void Zandor::FollowJoin(clsJoinLine& JoinLine) {
    const DrawnEnd& left = JoinLine.LeftEnd;
    const DrawnEnd& right = JoinLine.RightEnd;
    const Tabulet* const leftTable =
        JoinLine.Drawn ? TableAt(left, JoinLine.LeftTablehwnd()) : nullptr;
    const Tabulet* const rightTable =
        leftTable ? TableAt(right, JoinLine.RightTablehwnd()) : nullptr;
    if (!rightTable) return PlaceJoin(JoinLine);
    const platform::Bounds leftBox = leftTable->bounds();
    const platform::Bounds rightBox = rightTable->bounds();
    const bool leftIsWest = rightBox.Left > leftBox.Left;
    if (leftIsWest != *JoinLine.Drawn || rightBox.Left == leftBox.Left) return PlaceJoin(JoinLine);

    const auto westPoint = (leftIsWest ? left : right).Item->RightEdgePoint();
    const auto eastPoint = (leftIsWest ? right : left).Item->LeftEdgePoint();
    const auto markAt = [](float x, float row, const platform::Bounds& box) {
        return platform::Bounds{x, clampedTop(row, connectorSize, box), connectorSize,
                                connectorSize};
    };
    const platform::Bounds placeA =
        markAt(westPoint.X, westPoint.Y, leftIsWest ? leftBox : rightBox);
    const platform::Bounds placeB =
        markAt(single(eastPoint.X - connectorSize), eastPoint.Y, leftIsWest ? rightBox : leftBox);
    shpJoin(JoinLine.LeftConnectorIndex())->setBounds(placeA);
    shpJoin(JoinLine.RightConnectorIndex())->setBounds(placeB);
    const LineEnds ends = lineBetween(westPoint.X, placeA, eastPoint.X, placeB);
    PlaceLine(JoinLine, ends.X1, ends.Y1, ends.X2, ends.Y2);
}

void Zandor::DrawJoins() {
    Guard(u"DrawJoins", [&] {
        for (const auto& record : platform::Each<clsJoinLine>(mJoinLines)) DrawJoin(*record);
    });
}

float Zandor::DeltaJoinLine(float X, float Y, float X1, float Y1, float X2, float Y2) {
    float result = 0;
    Guard(u"DeltaJoinLine", [&] {
        const double dx = static_cast<double>(X2) - X1;
        const double dy = static_cast<double>(Y2) - Y1;
        const float length = single(std::sqrt(dy * dy + dx * dx));
        if (length == 0) throw platform::errors::divisionByZero();
        const double a = single(dx / length);
        const double b = single(dy / length);
        const double c = single(-X1 * b + Y1 * a);
        result = single((-X * b + Y * a) - c);
    });
    return result;
}

bool Zandor::JoinHitTest(Ref<clsJoinLine>& JoinLine, float X, float Y) {
    bool result = true;
    Guard(u"JoinHitTest", [&] {
        // Of all lines there are, hardly one comes to the exact test.
        float best = 1E+38F;
        for (std::uint64_t near = mReaches.near(X, Y); near != 0; near &= near - 1) {
            const std::int32_t n = std::countr_zero(near) + 1;
            if (n > mJoinLines.Count()) break; // a host has removed joins at a report
            Ref<clsJoinLine> record = mJoinLines.Peek(n);
            const platform::Line& line = *linJoin(record->JoinLineIndex());
            float firstX = line.X1(), firstY = line.Y1();
            float secondX = line.X2(), secondY = line.Y2();
            if (firstX >= secondX) {
                std::swap(firstX, secondX);
                std::swap(firstY, secondY);
            }
            if (X < firstX || X > secondX) continue;
            const float distance = std::fabs(DeltaJoinLine(X, Y, firstX, firstY, secondX, secondY));
            if (distance < hitTolerance && distance < best) {
                best = distance;
                JoinLine = std::move(record);
            }
        }
        result = JoinLine != nullptr;
    });
    return result;
}

} // namespace TalvikDBxZandor

#include <Zandor/Zandor.h>

#include <Zandor/platform/Numbers.h>

#include <cmath>

namespace TalvikDBxZandor {

using platform::single;

namespace {

constexpr float connectorSize = 140;
constexpr float hitTolerance = 50;
constexpr std::int32_t leftOuter = 1;

/// The top of a mark beside a row whose middle is at `rowMiddle`: level with the row, but never
/// outside the table's frame, so that the mark of a row scrolled out of view stays at its edge.
float clampedTop(float rowMiddle, float markHeight, const TalvikTabulet::Tabulet& table) {
    const float half = markHeight / 2;
    const float tableTop = table.Top();
    if (tableTop >= single(rowMiddle - half)) return tableTop;
    const float tableBottom = single(tableTop + table.Height());
    if (tableBottom <= single(rowMiddle + half)) return single(tableBottom - markHeight);
    return single(rowMiddle - half);
}

void sizeMark(platform::Shape& mark) {
    mark.setBounds({mark.Left(), mark.Top(), connectorSize, connectorSize});
}

/// Its left edge is in place even where its top cannot be told.
void placeMark(platform::Shape& mark, float left, float rowMiddle,
               const TalvikTabulet::Tabulet& table) {
    platform::Bounds place{left, mark.Top(), connectorSize, connectorSize};
    try {
        place.Top = clampedTop(rowMiddle, connectorSize, table);
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

// Nothing on this way reaches the host, the hook included, so it holds nothing: it runs for each
// join of a table at each step of its move.
void Zandor::PlaceJoin(const clsJoinLine& JoinLine) {
    Ref<Tabulet> leftTable, rightTable;
    Ref<ColumnItem> leftItem, rightItem;
    for (const auto& [index, table] : lstTable) {
        if (index == 0) continue;
        const bool left = table->TableHandle() == JoinLine.LeftTablehwnd();
        if (!left && table->TableHandle() != JoinLine.RightTablehwnd()) continue;
        (left ? leftTable : rightTable) = table;
        auto& entries = table->ColumnItems();
        for (std::int32_t n = 1; n <= entries.Count(); ++n) {
            const auto& entry = entries.Item(n);
            if (left && JoinLine.IsLeftColumn(entry->ColumnItemName())) leftItem = entry;
            if (!left && JoinLine.IsRightColumn(entry->ColumnItemName())) rightItem = entry;
        }
    }

    platform::Shape& markA = *shpJoin(JoinLine.LeftConnectorIndex());
    platform::Shape& markB = *shpJoin(JoinLine.RightConnectorIndex());
    markA.ShapeStyle(platform::shapeSquare); // takes the circle of an earlier type back
    markB.ShapeStyle(platform::shapeSquare);
    sizeMark(markA);
    sizeMark(markB);

    const bool leftIsWest = rightTable->Left() > leftTable->Left();
    Tabulet& west = leftIsWest ? *leftTable : *rightTable;
    Tabulet& east = leftIsWest ? *rightTable : *leftTable;
    const auto westPoint = (leftIsWest ? leftItem : rightItem)->RightEdgePoint();
    const auto eastPoint = (leftIsWest ? rightItem : leftItem)->LeftEdgePoint();

    placeMark(markA, westPoint.X, westPoint.Y, west);
    placeMark(markB, single(eastPoint.X - connectorSize), eastPoint.Y, east);

    // The circle stands at the eastern end whichever side of the join that is; only with both
    // tables at the same place does it stand at the western one.
    if (JoinLine.JoinType() == leftOuter)
        (east.Left() > west.Left() ? markB : markA).ShapeStyle(platform::shapeCircle);

    platform::Line& line = *linJoin(JoinLine.JoinLineIndex());
    line.setEnds(single(westPoint.X + markA.Width()), single(markA.Top() + markA.Height() / 2),
                 single(eastPoint.X - markB.Width()), single(markB.Top() + markB.Height() / 2));
    if (const auto placed = mHooks.JoinPlaced)
        placed({.LeftTable = leftTable->Text(),
                .LeftColumn = leftItem->Text(),
                .RightTable = rightTable->Text(),
                .RightColumn = rightItem->Text(),
                .JoinType = JoinLine.JoinType(),
                .CompareOperator = JoinLine.CompareOperator(),
                .LeftIsWest = leftIsWest},
               line);
    line.Visible(true);
    markA.Visible(true);
    markB.Visible(true);
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
        float best = 1E+38F;
        for (const auto& record : platform::Each<clsJoinLine>(mJoinLines)) {
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
                JoinLine = record;
            }
        }
        result = JoinLine != nullptr;
    });
    return result;
}

} // namespace TalvikDBxZandor

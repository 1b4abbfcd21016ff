#pragma once

#include <Zandor/platform/Control.h>
#include <Zandor/platform/Tabulet.h>

#include <algorithm>
#include <cstdint>

namespace zandor::comforts {

/// The edges of a table that its user has in hand, added up; none: the whole table.
enum Edges : unsigned { noEdge = 0, topEdge = 1, leftEdge = 2, rightEdge = 4, bottomEdge = 8 };

/// A table that its user moves or resizes, for every front end alike: where it goes meanwhile, and
/// what the control is told in the end. In twips.
class BoxGesture {
public:
    using Bounds = platform::Bounds; ///< in twips

    /// From where the table stands.
    void begin(const Bounds& at) { mStart = at; }
    /// Where that was, to which a gesture that is taken back returns.
    const Bounds& start() const { return mStart; }

    /// The table's place when the mouse has gone so far. It becomes no smaller than the smallest,
    /// which for one that began smaller is the size that it had.
    Bounds at(unsigned edges, float right, float down, float leastWidth, float leastHeight) const {
        Bounds box = mStart;
        if (!edges) {
            box.Left += right;
            box.Top += down;
        }
        const float width = std::min(leastWidth, box.Width);
        const float height = std::min(leastHeight, box.Height);
        if (edges & rightEdge) box.Width = std::max(box.Width + right, width);
        if (edges & bottomEdge) box.Height = std::max(box.Height + down, height);
        if (edges & leftEdge) {
            const float by = std::min(right, box.Width - width);
            box.Left += by;
            box.Width -= by;
        }
        if (edges & topEdge) {
            const float by = std::min(down, box.Height - height);
            box.Top += by;
            box.Height -= by;
        }
        return box;
    }

    /// The end of it. The control may end the table in each event; `isAlive` says whether it has
    /// not, and is called without it.
    template <class Alive>
    void end(unsigned edges, platform::Control& table, const TalvikTabulet::TabuletEvents& events,
             std::int16_t index, const Alive& isAlive) const {
        const Bounds left = table.bounds();
        // Near a corner an edge takes its neighbour along, which may have stayed where it was.
        const bool cornerMoved = left.Left != mStart.Left || left.Top != mStart.Top;
        if ((!edges || cornerMoved) && events.Moved) events.Moved(index);
        if (!edges || !isAlive()) return;
        if (cornerMoved) keepOppositeEdges(table, left);
        if (events.Resized) events.Resized(index);
    }

private:
    /// The control brings a corner that was pulled out of sight back; the other edges are to stay.
    static void keepOppositeEdges(platform::Control& table, const Bounds& left) {
        Bounds box = table.bounds();
        if (box.Left != left.Left) box.Width = std::max(left.Left + left.Width - box.Left, 0.0F);
        if (box.Top != left.Top) box.Height = std::max(left.Top + left.Height - box.Top, 0.0F);
        if (box != table.bounds()) table.setBounds(box);
    }

    Bounds mStart;
};

} // namespace zandor::comforts

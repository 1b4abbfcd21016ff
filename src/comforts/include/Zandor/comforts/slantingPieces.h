#pragma once

#include <algorithm>
#include <cmath>
#include <vector>

namespace zandor::comforts {

/// A part of a line: from a point to a point, in the unit that the line was given in.
struct LinePiece {
    double fromX = 0; ///< across
    double fromY = 0; ///< down
    double toX = 0;   ///< across
    double toY = 0;   ///< down
};

/// A slanting line in pieces, for who paints what it covers: its bounding box is far larger than
/// what it changes. In pixels. More pieces cost more in regions than they spare in pixels.
inline std::vector<LinePiece> slantingPieces(const LinePiece& line) {
    const double across = line.toX - line.fromX;
    const double down = line.toY - line.fromY;
    const double thin = std::min(std::abs(across), std::abs(down));
    const int count = std::clamp(static_cast<int>(thin / 128), 1, 3);
    std::vector<LinePiece> pieces;
    for (int i = 0; i < count; ++i)
        pieces.push_back({line.fromX + across * i / count, line.fromY + down * i / count,
                          line.fromX + across * (i + 1) / count,
                          line.fromY + down * (i + 1) / count});
    return pieces;
}

} // namespace zandor::comforts

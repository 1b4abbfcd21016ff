#include "Databases.h"

#include "designer/DesignerWindow.h"

#include <gtest/gtest.h>

#include <QCoreApplication>

namespace {

constexpr int twipsPerPixel = 15;

/// A query of one table that stands and ends where the test says.
designer::OpenedQuery oneTable(std::int32_t left, std::int32_t top) {
    const auto opened = openedSample({{}, {"orders"}, {}, false});
    const auto table = opened.query->Tables().Item(1);
    table->Left(static_cast<float>(left));
    table->Top(static_cast<float>(top));
    table->Width(2000);
    table->Height(2000);
    return opened;
}

void resizeTo(designer::DesignerWindow& window, int width, int height) {
    window.resize(width, height);
    window.show();
    QCoreApplication::processEvents();
}

} // namespace

TEST(TheDesignersCanvas, IsAsLargeAsWhatCanBeSeenOfIt) {
    designer::DesignerWindow window(oneTable(300, 300));
    resizeTo(window, 1300, 900);
    EXPECT_EQ(window.designer().MXHorzFrameSize(), 1300 * twipsPerPixel);
    EXPECT_EQ(window.designer().MXVertFrameSize(), window.designer().height() * twipsPerPixel);
    EXPECT_EQ(window.designer().HorizMaxScrollPos(), 0);
    EXPECT_EQ(window.designer().VertMaxScrollPos(), 0);
}

TEST(TheDesignersCanvas, ReachesATableBeyondTheRightEdge) {
    designer::DesignerWindow window(oneTable(25000, 300));
    resizeTo(window, 1200, 800);
    EXPECT_EQ(window.designer().MXHorzFrameSize(), 25000 + 2000 + 300);
    EXPECT_EQ(window.designer().HorizMaxScrollPos(), 27300 - 1200 * twipsPerPixel);
}

TEST(TheDesignersCanvas, CanBeScrolledToATableBehindTheGrid) {
    designer::DesignerWindow window(oneTable(300, 7000));
    resizeTo(window, 1200, 800);
    const int upperHalf = window.designer().height() * twipsPerPixel / 2;
    ASSERT_GT(7000 + 2000, upperHalf);
    EXPECT_GE(window.designer().VertMaxScrollPos(), 7000 + 2000 - upperHalf);
}

TEST(TheDesignersCanvas, EndsWhereTheControlsNumbersEnd) {
    designer::DesignerWindow window(oneTable(40000, 50000));
    resizeTo(window, 1200, 800);
    EXPECT_EQ(window.designer().MXHorzFrameSize(), 32767);
    EXPECT_EQ(window.designer().MXVertFrameSize(), 32767);
}

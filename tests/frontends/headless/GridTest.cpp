#include "frontends/headless/Bench.h"

using namespace zandor;

namespace {

struct GridBench : Bench {
    std::string log;
    std::unique_ptr<MSFlexGridLib::MSFlexGrid> grid = toolkit.makeGrid(
        {.Name = u"sprColumn"}, 12, 6,
        {.MouseDown = [this](std::int16_t button, std::int16_t, float X,
                             float Y) { note("down", button, X, Y); },
         .MouseUp = [this](std::int16_t button, std::int16_t, float X,
                           float Y) { note("up", button, X, Y); },
         .DragDrop = [this](platform::Control* source, float X,
                            float Y) { note(source == held ? "drop" : "wrong source", 0, X, Y); },
         .Scroll = [this] { log += "scroll "; }});
    platform::Control* held = nullptr;

    void note(const char* what, int button, float X, float Y) {
        log += std::string(what) + std::to_string(button) + "@" +
               std::to_string(static_cast<int>(X)) + "," + std::to_string(static_cast<int>(Y)) +
               " ";
    }
};

TEST(TheGrid, StartsInTheFirstCellThatScrolls) {
    GridBench b;
    EXPECT_EQ(b.grid->Row(), 1);
    EXPECT_EQ(b.grid->Col(), 1);
    EXPECT_EQ(b.grid->TopRow(), 1);
    EXPECT_EQ(b.grid->LeftCol(), 1);
    EXPECT_EQ(b.grid->Rows(), 12);
    EXPECT_EQ(b.grid->Cols(), 6);
}

TEST(TheGrid, RefusesRowsAndColumnsThatItLacks) {
    GridBench b;
    for (const std::int32_t row : {-1, 12}) {
        EXPECT_EQ(errorOf([&] { b.grid->Row(row); }), 30009);
        EXPECT_EQ(errorOf([&] { b.grid->RowPos(row); }), 30009);
        EXPECT_EQ(errorOf([&] { b.grid->TextMatrix(row, 0); }), 381);
        EXPECT_EQ(errorOf([&] { b.grid->TextMatrix(row, 0, u"x"); }), 381);
    }
    for (const std::int32_t col : {-1, 6}) {
        EXPECT_EQ(errorOf([&] { b.grid->Col(col); }), 30010);
        EXPECT_EQ(errorOf([&] { b.grid->ColPos(col); }), 30010);
        EXPECT_EQ(errorOf([&] { b.grid->ColWidth(col); }), 30010);
        EXPECT_EQ(errorOf([&] { b.grid->ColWidth(col, 10); }), 30010);
        EXPECT_EQ(errorOf([&] { b.grid->ColData(col); }), 30010);
        EXPECT_EQ(errorOf([&] { b.grid->ColData(col, 1); }), 30010);
        EXPECT_EQ(errorOf([&] { b.grid->ColPosition(col, 1); }), 30010);
        EXPECT_EQ(errorOf([&] { b.grid->ColPosition(1, col); }), 30010);
        EXPECT_EQ(errorOf([&] { b.grid->TextMatrix(0, col); }), 381);
        EXPECT_EQ(errorOf([&] { b.grid->TextMatrix(0, col, u"x"); }), 381);
    }
    EXPECT_EQ(errorOf([&] { b.grid->ColWidth(1, -1); }), 380);
    EXPECT_EQ(errorOf([&] { b.grid->CellAlignment(10); }), 380);
    EXPECT_EQ(b.grid->Row(), 1);
    EXPECT_EQ(b.grid->Col(), 1);
    EXPECT_EQ(b.grid->ColWidth(1), headless::gridColWidth);
}

TEST(TheGrid, ReadsAndWritesTheCurrentCell) {
    GridBench b;
    b.grid->Row(2);
    b.grid->Col(3);
    b.grid->Text(u"Ascending");
    b.grid->CellAlignment(MSFlexGridLib::alignCenterCenter);
    EXPECT_EQ(b.grid->TextMatrix(2, 3), u"Ascending");
    const auto& cell = b.look<headless::Grid>("sprColumn").cell(2, 3);
    EXPECT_EQ(cell.alignment, MSFlexGridLib::alignCenterCenter);
    EXPECT_EQ(b.look<headless::Grid>("sprColumn").cell(2, 2).alignment,
              MSFlexGridLib::alignLeftCenter);
}

TEST(AScrolledGrid, KeepsItsFixedCellsAndMovesTheOthers) {
    GridBench b;
    b.grid->ColWidth(0, 500);
    b.grid->ColWidth(1, 300);
    b.grid->ColWidth(2, 200);
    EXPECT_EQ(b.grid->ColPos(3), 1000);
    b.user.scrollGrid("sprColumn", 4, 3);
    EXPECT_EQ(b.log, "scroll ");
    EXPECT_EQ(b.grid->ColPos(0), 0);
    EXPECT_EQ(b.grid->ColPos(3), 500);
    EXPECT_EQ(b.grid->ColPos(2), 300);
    EXPECT_EQ(b.grid->ColPos(1), 0);
    EXPECT_EQ(b.grid->RowPos(0), 0);
    EXPECT_EQ(b.grid->RowPos(4), headless::gridRowHeight);
    EXPECT_EQ(b.grid->RowPos(3), 0);
    b.grid->Row(5);
    b.grid->Col(4);
    EXPECT_EQ(b.grid->CellLeft(), 500 + headless::gridColWidth);
    EXPECT_EQ(b.grid->CellTop(), 2 * headless::gridRowHeight);
    EXPECT_EQ(b.grid->CellWidth(), headless::gridColWidth);
    EXPECT_EQ(b.grid->CellHeight(), headless::gridRowHeight);
}

TEST(AScrolledGrid, StopsAtItsEndsAndFiresOnARealChangeOnly) {
    GridBench b;
    b.user.scrollGrid("sprColumn", 0, -3);
    EXPECT_EQ(b.log, "");
    b.user.scrollGrid("sprColumn", 99, 99);
    b.user.scrollGrid("sprColumn", 99, 99);
    EXPECT_EQ(b.log, "scroll ");
    EXPECT_EQ(b.grid->TopRow(), 11);
    EXPECT_EQ(b.grid->LeftCol(), 5);
}

TEST(ColPosition, MovesEverythingOfAColumn) {
    GridBench b;
    for (std::int32_t col = 0; col < 6; ++col) {
        b.grid->TextMatrix(0, col, platform::decimal(col));
        b.grid->ColData(col, 10 * col);
        b.grid->ColWidth(col, static_cast<float>(100 * (col + 1)));
        b.grid->Row(0);
        b.grid->Col(col);
        b.grid->CellAlignment(static_cast<std::int16_t>(col));
    }
    const auto order = [&] {
        std::string texts;
        for (std::int32_t col = 0; col < 6; ++col) {
            const auto& cell = b.look<headless::Grid>("sprColumn").cell(0, col);
            const std::string text = platform::toUtf8(cell.text);
            EXPECT_EQ(b.grid->ColData(col), 10 * std::stoi(text));
            EXPECT_EQ(b.grid->ColWidth(col), 100 * (std::stoi(text) + 1));
            EXPECT_EQ(cell.alignment, std::stoi(text));
            texts += text;
        }
        return texts;
    };
    b.grid->ColPosition(5, 2);
    EXPECT_EQ(order(), "015234");
    b.grid->ColPosition(2, 5);
    EXPECT_EQ(order(), "012345");
    b.grid->ColPosition(3, 3);
    EXPECT_EQ(order(), "012345");
}

TEST(TheGrid, TellsPressesInItsOwnCoordinates) {
    GridBench b;
    b.grid->setBounds({0, 4000, 9000, 4000});
    b.user.pressCell("sprColumn", platform::leftButton, 2, 1);
    b.user.releaseCell("sprColumn", platform::rightButton, 0, 0);
    EXPECT_EQ(b.log, "down1@1440,600 up2@480,120 ");
    EXPECT_TRUE(b.look<headless::Grid>("sprColumn").focused());
    b.user.scrollGrid("sprColumn", 3, 1);
    EXPECT_THROW(b.user.pressCell("sprColumn", platform::leftButton, 2, 1), std::logic_error);
}

TEST(ADragToTheGrid, DropsTheTableListInTheMiddleOfTheCell) {
    GridBench b;
    auto table = b.table(1);
    b.held = table.get();
    b.tableEvents.back().ColumnMouseMove = [&](auto...) { table->Drag(1); };
    b.user.dragToCell("lstTable(1)", 2, "sprColumn", 1, 2);
    EXPECT_EQ(b.log, "drop0@2400,360 ");
    EXPECT_EQ(b.toolkit.dragged(), nullptr);
}

} // namespace

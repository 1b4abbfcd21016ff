#pragma once

#include "frontends/qt/GridModel.h"
#include "frontends/qt/GridWidget.h"
#include "support/QtHands.h"
#include "support/Sample.h"

#include <Zandor/ZandorWidget.h>

#include <QScrollBar>

#include <gtest/gtest.h>

#include <cstdio>
#include <functional>
#include <set>
#include <string>

/// Every editor, opened by mouse and by key over the first and the last column in sight, in windows
/// of every size, over canvases smaller and larger than the window, scrolled to the start, the
/// middle and the end. An editor that was opened stays open, has the keyboard and lies inside the
/// control. The control is asked for each time, since a host may make a new one.
class EditorMatrix {
public:
    using Control = std::function<ZandorWidget&()>;

    EditorMatrix(QWidget& window, Control control)
        : mWindow(window), mControl(std::move(control)) {}

    /// Tries all cells, or a sample of them (Sample.h), fails the test for each editor that does
    /// not stay, and says how many cells there were.
    void run() {
        for (const QSize size : {QSize(600, 400), QSize(900, 600), QSize(1024, 600),
                                 QSize(1070, 700), QSize(1100, 1100), QSize(1366, 768),
                                 QSize(1920, 1080), QSize(2200, 1300), QSize(3840, 2160)})
            for (const bool larger : {false, true}) {
                layOut(size, larger);
                std::set<std::pair<int, int>> places;
                for (const double share : {0.0, 0.5, 1.0}) {
                    scrollTo(share);
                    // A canvas that does not scroll has one place only.
                    const bool fresh = places
                                           .insert({control().HorizontalScrollbarPos(),
                                                    control().VerticalScrollbarPos()})
                                           .second;
                    if (fresh) tryEditors(size, larger, share);
                }
            }
        std::printf("%d cells: window, canvas, scroll, editor, column, mouse or key\n", mCells);
        ::testing::Test::RecordProperty("cells", mCells);
        EXPECT_GT(mCells, 0);
    }

private:
    ZandorWidget& control() { return mControl(); }

    template <class W>
    W* part(const char* name) {
        for (QWidget* child : control().findChildren<QWidget*>(QLatin1String(name)))
            if (auto* found = dynamic_cast<W*>(child)) return found;
        throw std::logic_error(std::string("there is no ") + name);
    }

    /// Lets everything run that the events so far have caused, on the screen as well.
    static void settle() {
        for (int round = 0; round < 4; ++round) {
            qApp->sync();
            QCoreApplication::sendPostedEvents();
            qApp->processEvents();
        }
    }

    void layOut(QSize size, bool larger) {
        static constexpr int most = 32767; // of a 16-bit integer
        mWindow.resize(size);
        settle();
        const QSize area = control().size();
        const auto twips = [larger](int pixels) {
            return larger ? std::min(pixels * 15 + 6000, most) : pixels * 15 / 3;
        };
        control().setMXHorzFrameSize(twips(area.width()));
        control().setMXVertFrameSize(twips(area.height()));
        control().control().UserControl_Resize();
        settle();
    }

    void scrollTo(double share) {
        const auto at = [share](int max) { return static_cast<int>(max * share); };
        control().setHorizontalScrollbarPos(at(control().HorizMaxScrollPos()));
        control().setVerticalScrollbarPos(at(control().VertMaxScrollPos()));
        settle();
    }

    void tryEditors(QSize size, bool larger, double share) {
        for (const auto& [row, frame] : {std::pair{2, "fraSortOrder"},
                                         std::pair{3, "fraVisibility"}, std::pair{4, "fraValue"}})
            for (const int column : {1, lastColumnInSight()})
                for (const bool byKey : {false, true}) {
                    if (mTried++ % mStep != 0) continue;
                    if (!open(row, column, byKey)) continue;
                    ++mCells;
                    settle();
                    const std::string cell =
                        std::string(frame) + " over column " + std::to_string(column) +
                        (byKey ? ", by key" : ", by mouse") + ", window " +
                        std::to_string(size.width()) + "x" + std::to_string(size.height()) +
                        (larger ? ", larger" : ", smaller") + " canvas, scrolled by " +
                        std::to_string(share);
                    check(*part<QWidget>(frame), cell);
                }
    }

    void check(QWidget& frame, const std::string& cell) {
        const QWidget* const focus = control().window()->focusWidget();
        EXPECT_TRUE(frame.isVisible()) << cell;
        EXPECT_TRUE(focus && frame.isAncestorOf(focus)) << cell;
        EXPECT_TRUE(control().rect().contains(frame.geometry())) << cell;
        if (!frame.isVisible() || !focus) return;
        hands::key(*control().window()->focusWidget(), Qt::Key_Escape);
        settle();
        EXPECT_FALSE(frame.isVisible()) << cell << ", after Escape";
    }

    zandor::platform::qt::GridWidget& grid() {
        return *part<zandor::platform::qt::GridWidget>("sprColumn");
    }

    /// Of those that are filled.
    int lastColumnInSight() {
        int last = 1;
        for (int column = 1; !grid().model().text(0, column).isEmpty(); ++column)
            if (grid().rect().contains(grid().cellRect(1, column))) last = column;
        return last;
    }

    /// False for a cell that the mouse cannot reach.
    bool open(int row, int column, bool byKey) {
        QTableView& view = grid().view();
        if (byKey) {
            view.setFocus(Qt::TabFocusReason);
            view.setCurrentIndex(view.model()->index(row - 1, column - 1));
            settle();
            hands::key(view, Qt::Key_Return);
            return true;
        }
        const QPoint at = grid().cellRect(row, column).center();
        QWidget* const viewport = view.viewport();
        const QPoint inside = viewport->mapFrom(&grid(), at);
        if (!viewport->rect().contains(inside)) return false;
        hands::click(*viewport, inside);
        return true;
    }

    QWidget& mWindow;
    const Control mControl;
    const int mStep = sampleStep();
    int mTried = 0;
    int mCells = 0;
};

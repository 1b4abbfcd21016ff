#include "OpenWindow.h"
#include "RandomHands.h"

#include <Zandor/Library.h>
#include <Zandor/Query.h>
#include <Zandor/ZandorWidget.h>

#include <QClipboard>
#include <QElapsedTimer>
#include <QFile>
#include <QGridLayout>
#include <QGuiApplication>
#include <QPixmapCache>

#include <algorithm>
#include <cstdio>
#include <malloc.h>

using namespace zandor;

namespace {

double wanted(const char* variable, double otherwise) {
    const QByteArray text = qgetenv(variable);
    return text.isEmpty() ? otherwise : text.toDouble();
}

// For how long a run goes on; a test among others is short.
double minutes() { return wanted("ZANDOR_MINUTES", 0.1); }
int rounds() { return static_cast<int>(wanted("ZANDOR_ROUNDS", 10)); }

// What is kept once shows by then, and what grows.
constexpr double minutesToTell = 10;
constexpr int roundsToTell = 200;

struct Memory {
    double heap;     ///< KiB in use
    double resident; ///< KiB of its own: pages of libraries and fonts come as they are used

    static Memory now() {
        QPixmapCache::clear();                 // it grows to a limit of its own
        QGuiApplication::clipboard()->clear(); // a copied picture is larger than all else
        malloc_trim(0);
        const auto all = mallinfo2();
        return {static_cast<double>(all.uordblks + all.hblkhd) / 1024, residentOfItsOwn()};
    }

private:
    static double residentOfItsOwn() {
        QFile status(QStringLiteral("/proc/self/status"));
        EXPECT_TRUE(status.open(QIODevice::ReadOnly));
        for (const QByteArray& line : status.readAll().split('\n'))
            if (line.startsWith("RssAnon:"))
                return line.simplified().split(' ').value(1).toDouble();
        ADD_FAILURE() << "the system does not say how much of the memory is the process's own";
        return 0;
    }
};

/// That what was sampled last is no more than what was sampled when everything had been used once.
void expectFlat(std::vector<double> samples, const char* what) {
    const auto middle = [](auto from, auto to) {
        std::vector<double> part(from, to);
        std::ranges::nth_element(part, part.begin() + static_cast<long>(part.size() / 2));
        return part[part.size() / 2];
    };
    const auto quarter = static_cast<long>(samples.size() / 4);
    ASSERT_GT(quarter, 0);
    const double early = middle(samples.begin() + quarter, samples.begin() + 2 * quarter);
    const double late = middle(samples.end() - quarter, samples.end());
    std::printf("[ MEMORY   ] %s: %.0f KiB in the second quarter, %.0f in the last\n", what, early,
                late);
    EXPECT_LE(late, early * 1.05 + 1024) << what;
}

class ALongRun : public OpenWindow {
protected:
    ALongRun() {
        // Qt keeps the names of all pictures that have ever been in its cache: none gets in.
        QPixmapCache::setCacheLimit(0);
        // The allocator keeps room for each thread, which malloc_trim() leaves: here they share
        // one.
        mallopt(M_ARENA_MAX, 1);
    }
    ~ALongRun() override { QPixmapCache::setCacheLimit(mCacheLimit); }

    void open() {
        OpenWindow::open();
        mSize = window->size();
        mLayout = window->saveState();
    }

    /// The window as it was opened: nothing in it that the user has made, and its panels where they
    /// were, for one that floats has memory of its own.
    void clear(RandomHands& user) {
        user.leave(true);
        command("new");
        calm();
        user.leave(false);
        // Hidden, for QMainWindow shows the tab bars of panels while their set still changes.
        window->hide();
        EXPECT_TRUE(window->restoreState(mLayout));
        window->show();
        // What Qt paints on keeps room for the longest path ever painted, until it is made anew.
        window->resize(mSize + QSize(1, 1));
        calm();
        window->resize(mSize);
        calm();
    }

private:
    const int mCacheLimit = QPixmapCache::cacheLimit();
    QSize mSize;
    QByteArray mLayout;
};

TEST_F(ALongRun, OfRandomWorkKeepsTheMemoryFlat) {
    open();
    const auto seed = qEnvironmentVariableIntValue("ZANDOR_SEED");
    RandomHands user(*window, static_cast<unsigned>(seed));
    QElapsedTimer clock;
    clock.start();
    const auto end = static_cast<qint64>(minutes() * 60'000);
    const auto betweenSamples = std::max<qint64>(end / 60, 1);
    std::vector<double> heap;
    std::vector<double> resident;
    while (clock.elapsed() < end) {
        const int tables = list().model()->rowCount(); // of those that the user has looked for
        if (tables > 0) add(list().model()->index(user.done() % tables, 0).data().toString());
        for (int n = 0; n < 200; ++n) user.act();
        if (clock.elapsed() < betweenSamples * static_cast<qint64>(heap.size() + 1)) continue;
        clear(user);
        const Memory now = Memory::now();
        heap.push_back(now.heap);
        resident.push_back(now.resident);
        std::printf("[ MEMORY   ] %6.1f s, %7d deeds: heap %.0f KiB, resident %.0f KiB\n",
                    static_cast<double>(clock.elapsed()) / 1000, user.done(), now.heap,
                    now.resident);
        std::fflush(stdout);
    }
    EXPECT_TRUE(window->isVisible());
    EXPECT_GT(user.done(), 0);
    clear(user); // what is not saved would be there in the next window
    if (minutes() < minutesToTell) return;
    expectFlat(heap, "heap");
    expectFlat(resident, "resident");
}

TEST_F(ALongRun, OfWindowsOpenedAndClosedKeepsTheMemoryFlat) {
    std::vector<double> heap;
    std::vector<double> resident;
    for (int round = 0; round < rounds(); ++round) {
        open();
        const auto before = shownTables().size();
        add(QStringLiteral("orders"));
        add(QStringLiteral("customers"));
        EXPECT_EQ(shownTables().size(), before + 2);
        {
            RandomHands user(*window, 0);
            clear(user);
        }
        window.reset();
        calm();
        const Memory now = Memory::now();
        heap.push_back(now.heap);
        resident.push_back(now.resident);
        if (round % 50 == 0) std::printf("[ MEMORY   ] round %d: heap %.0f KiB\n", round, now.heap);
    }
    if (rounds() < roundsToTell) return;
    expectFlat(heap, "heap");
    expectFlat(resident, "resident");
}

TEST_F(ALongRun, OfTenControlsInOneWindowLeavesEachItsOwn) {
    model::Library library;
    QWidget host;
    auto* const layout = new QGridLayout(&host);
    std::vector<platform::Ref<model::Query>> queries;
    std::vector<ZandorWidget*> controls;
    for (int n = 0; n < 10; ++n) {
        queries.push_back(platform::makeRef<model::Query>());
        queries.back()->addTable(
            {.schema = u"", .name = u"orders", .columns = {{u"id"}, {u"day"}}});
        auto* const control = new ZandorWidget(library);
        control->setDebugSwitch(0);
        control->setOnlyJoin(n % 2 == 0);
        control->setModel(queries.back());
        layout->addWidget(control, n / 5, n % 5);
        controls.push_back(control);
    }
    host.resize(1920, 1000);
    host.show();
    const auto unused = queries.back()->record();
    controls.back()->setEnabled(false); // nobody uses that one
    RandomHands user(host, static_cast<unsigned>(qEnvironmentVariableIntValue("ZANDOR_SEED")));
    QElapsedTimer clock;
    clock.start();
    while (clock.elapsed() < std::min(minutes(), 5.0) * 60'000) user.act();
    EXPECT_GT(user.done(), 0);
    EXPECT_EQ(queries.back()->record(), unused);
    // Each goes on with its own model when another one is gone.
    while (controls.size() > 1) {
        delete controls.front();
        controls.erase(controls.begin());
        user.act();
        EXPECT_EQ(controls.back()->model(), queries.back());
    }
}

} // namespace

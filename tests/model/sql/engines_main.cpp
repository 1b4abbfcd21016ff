#include "Engines.h"

#include <QCoreApplication>

#include <gtest/gtest.h>

int main(int argc, char** argv) {
    // Moments come and go as local ones; every one of them exists in this zone.
    qputenv("TZ", "UTC");
    QCoreApplication application(argc, argv);
    testing::InitGoogleTest(&argc, argv);
    const int result = RUN_ALL_TESTS();
    stopEngines();
    return result;
}

#include "Boxes.h"

#include "frontends/windows/automation/com/system.h"

#include <gtest/gtest.h>

int main(int argc, char** argv) {
    testing::InitGoogleTest(&argc, argv);
    OleInitialize(nullptr);
    const Boxes closed;
    const int result = RUN_ALL_TESTS();
    OleUninitialize();
    return result;
}

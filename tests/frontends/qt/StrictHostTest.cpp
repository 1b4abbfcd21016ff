#include "frontends/qt/strict_host/StrictHost.h"

#include <gtest/gtest.h>

TEST(AStrictHost, EmbedsTheWidgetAndHearsItsSignals) { EXPECT_EQ(strict::errorsHeard(), 1); }

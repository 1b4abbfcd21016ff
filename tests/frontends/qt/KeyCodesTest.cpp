#include "frontends/qt/KeyCodes.h"

#include <QKeyEvent>

#include <gtest/gtest.h>

#include <utility>

namespace qt = zandor::platform::qt;

namespace {

QKeyEvent pressed(int key, Qt::KeyboardModifiers held = {}, const QString& text = {}) {
    return {QEvent::KeyPress, key, held, text};
}

} // namespace

TEST(AKey, IsToldToAHostByItsNumber) {
    const std::pair<int, int> numbers[] = {
        {Qt::Key_F1, 112},    {Qt::Key_F12, 123},   {Qt::Key_PageUp, 33},   {Qt::Key_PageDown, 34},
        {Qt::Key_End, 35},    {Qt::Key_Home, 36},   {Qt::Key_Left, 37},     {Qt::Key_Up, 38},
        {Qt::Key_Right, 39},  {Qt::Key_Down, 40},   {Qt::Key_Insert, 45},   {Qt::Key_Delete, 46},
        {Qt::Key_A, 'A'},     {Qt::Key_Z, 'Z'},     {Qt::Key_0, '0'},       {Qt::Key_9, '9'},
        {Qt::Key_Space, ' '}, {Qt::Key_Tab, 9},     {Qt::Key_Backtab, 9},   {Qt::Key_Enter, 13},
        {Qt::Key_Return, 13}, {Qt::Key_Escape, 27}, {Qt::Key_Backspace, 8}, {Qt::Key_AltGr, 0}};
    for (const auto& [key, number] : numbers) EXPECT_EQ(qt::keyCode(pressed(key)), number) << key;
}

TEST(AKey, TypesWithAltGrAndWithNoCommand) {
    EXPECT_TRUE(qt::isTyping(pressed(Qt::Key_E, {}, "e")));
    EXPECT_TRUE(qt::isTyping(pressed(Qt::Key_E, Qt::ShiftModifier, "E")));
    EXPECT_TRUE(qt::isTyping(pressed(Qt::Key_E, Qt::ControlModifier | Qt::AltModifier, "€")));
    EXPECT_FALSE(qt::isTyping(pressed(Qt::Key_E, Qt::ControlModifier, "e")));
    EXPECT_FALSE(qt::isTyping(pressed(Qt::Key_E, Qt::AltModifier, "e")));
    EXPECT_FALSE(qt::isTyping(pressed(Qt::Key_E, Qt::MetaModifier, "e")));
    EXPECT_FALSE(qt::isTyping(pressed(Qt::Key_Left)));
    EXPECT_FALSE(qt::isTyping(pressed(Qt::Key_Tab, {}, "\t")));
}

TEST(AKey, OfTheNumberPadIsOneLikeOthers) {
    EXPECT_EQ(qt::modifiersOf(pressed(Qt::Key_Left, Qt::KeypadModifier | Qt::AltModifier)),
              Qt::AltModifier);
    EXPECT_TRUE(qt::isMenuKey(pressed(Qt::Key_F10, Qt::ShiftModifier | Qt::KeypadModifier)));
}

TEST(WhatIsHeld, IsToldToAHostBitByBit) {
    EXPECT_EQ(qt::shiftState({}), 0);
    EXPECT_EQ(qt::shiftState(Qt::ShiftModifier), 1);
    EXPECT_EQ(qt::shiftState(Qt::ControlModifier), 2);
    EXPECT_EQ(qt::shiftState(Qt::AltModifier), 4);
    EXPECT_EQ(qt::shiftState(Qt::ShiftModifier | Qt::ControlModifier | Qt::MetaModifier), 3);
    EXPECT_EQ(qt::buttonState(Qt::LeftButton | Qt::MiddleButton), 5);
    EXPECT_EQ(qt::buttonState(Qt::RightButton), 2);
}

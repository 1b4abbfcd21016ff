#include <QApplication>

#include <gtest/gtest.h>

int main(int argc, char** argv) {
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM")) qputenv("QT_QPA_PLATFORM", "offscreen");
    // No plug-in of the user's own home gets in.
    qputenv("HOME", "/nonexistent");
    QApplication application(argc, argv);
    QCoreApplication::addLibraryPath(QStringLiteral(ZANDOR_PLUGINS));
    testing::InitGoogleTest(&argc, argv);
    return RUN_ALL_TESTS();
}

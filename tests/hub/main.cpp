#include <QApplication>

#include <gtest/gtest.h>

int main(int argc, char** argv) {
    testing::InitGoogleTest(&argc, argv);
    if (!qEnvironmentVariableIsSet("QT_QPA_PLATFORM")) // as when the build asks for the tests' names
        qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication::setStyle("Fusion");
    const QApplication application(argc, argv);
    return RUN_ALL_TESTS();
}

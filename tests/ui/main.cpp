// Widget tests share one application object. They run offscreen unless told
// otherwise, also when CTest only lists them.
#include <QApplication>

#include <gmock/gmock.h>

int main(int argc, char *argv[]) {
    if (!qEnvironmentVariableIsSet("QT_QPA_PLATFORM")) {
        qputenv("QT_QPA_PLATFORM", "offscreen");
    }
    QApplication app(argc, argv);
    ::testing::InitGoogleMock(&argc, argv);
    return RUN_ALL_TESTS();
}

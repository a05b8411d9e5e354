#include <QApplication>

#include <gtest/gtest.h>

// Every test program runs with a real QApplication on the offscreen platform, so widgets can be
// built and driven without a display.
int main(int argc, char* argv[])
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication app(argc, argv);
    QApplication::setLayoutDirection(Qt::RightToLeft);
    ::testing::InitGoogleTest(&argc, argv);
    return RUN_ALL_TESTS();
}

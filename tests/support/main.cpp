#include <QCoreApplication>

#include <gtest/gtest.h>

// A core test program: Qt without a window or a GUI platform, as the command line runs.
int main(int argc, char* argv[])
{
    QCoreApplication app(argc, argv);
    ::testing::InitGoogleTest(&argc, argv);
    return RUN_ALL_TESTS();
}

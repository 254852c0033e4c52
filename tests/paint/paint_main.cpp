#include <QGuiApplication>

#include <gtest/gtest.h>

// Painting text needs an application object for the whole run, made before the tests and
// destroyed after them.
int main(int argc, char** argv)
{
    ::testing::InitGoogleTest(&argc, argv);
    QGuiApplication application(argc, argv);
    return RUN_ALL_TESTS();
}

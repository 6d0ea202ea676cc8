#include <QGuiApplication>

#include <gtest/gtest.h>

int main(int count, char** words)
{
    testing::InitGoogleTest(&count, words);
    if (!qEnvironmentVariableIsSet("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    const QGuiApplication application(count, words);
    return RUN_ALL_TESTS();
}

#include "desktop/shell/application.h"

#include <gtest/gtest.h>

int main(int count, char** words)
{
    testing::InitGoogleTest(&count, words);
    if (!qEnvironmentVariableIsSet("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    const kindrel::desktop::Application application(count, words);
    return RUN_ALL_TESTS();
}

// SPDX-License-Identifier: Apache-2.0
#include <gmock/gmock.h>

#include <QByteArray>
#include <QtGlobal>

int main(int argc, char** argv)
{
    // Tests with pictures are to run on machines without a screen.
    if (!qEnvironmentVariableIsSet("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    testing::InitGoogleMock(&argc, argv);
    return RUN_ALL_TESTS();
}

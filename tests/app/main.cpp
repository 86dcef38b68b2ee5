#include "Animation.h"
#include "Theme.h"

#include <QApplication>
#include <QTemporaryDir>

#include <gtest/gtest.h>

int main(int argc, char** argv)
{
    testing::InitGoogleTest(&argc, argv);
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    const QTemporaryDir root;
    qputenv("ORVEX_ROOT", root.path().toUtf8());
    qputenv("TZ", "XYZ-02"); // two hours before UTC tells local times from others
    const QApplication application(argc, argv);
    orvex::Theme::use(orvex::Theme::Mode::light);
    orvex::setAnimationsEnabled(false);
    return RUN_ALL_TESTS();
}

#include "Profile.h"

#include <QApplication>

#include <gmock/gmock.h>

int main(int argc, char **argv)
{
    // Pages are measured with fonts, windows are not shown, and nobody's own preferences are read or written.
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QApplication application(argc, argv);
    kareport::setProfileStore(kareport::makeMemoryProfile());
    testing::InitGoogleMock(&argc, argv);
    return RUN_ALL_TESTS();
}

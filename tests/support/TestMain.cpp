#include "Profile.h"

#include <QApplication>
#include <QDir>
#include <QTemporaryDir>

#include <gmock/gmock.h>

int main(int argc, char **argv)
{
    // Pages are measured with fonts, windows are not shown, and no user's own preferences are read or written.
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QApplication application(argc, argv);
    kareport::setProfileStore(kareport::makeMemoryProfile());
    // A file that a test writes by its name alone is not left among the sources.
    const QTemporaryDir folder;
    QDir::setCurrent(folder.path());
    testing::InitGoogleMock(&argc, argv);
    return RUN_ALL_TESTS();
}

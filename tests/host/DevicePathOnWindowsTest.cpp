#include "DevicePath.h"

#include "ReplaceFile.h"

#include <gtest/gtest.h>

namespace
{

struct Row
{
    const char *path;
    const char *device; ///< empty for a file
};
constexpr Row rows[] = {
    {"NUL", "\\\\.\\NUL"},
    {"nul", "\\\\.\\nul"},
    {"C:/folder/NUL", "\\\\.\\NUL"},
    {"nul.txt", "\\\\.\\nul"},
    {"COM1", "\\\\.\\COM1"},
    {"lpt9", "\\\\.\\lpt9"},
    {"\\\\.\\pipe\\reports", "\\\\.\\pipe\\reports"},
    {"COM0", ""},
    {"COM10", ""},
    {"NULL", ""},
    {"annul", ""},
    {"report.nul", ""},
    {"C:/NUL/report.txt", ""},
    {"", ""},
};

TEST(DevicePathOnWindows, SomeNamesAreDevicesInEveryFolder)
{
    for (const Row &row : rows) {
        EXPECT_EQ(kareport::devicePath(QString::fromUtf8(row.path)), QString::fromUtf8(row.device)) << row.path;
    }
}

TEST(DevicePathOnWindows, WhatIsWrittenToNulIsGone)
{
    QString error;
    EXPECT_TRUE(kareport::replaceFile(
        QStringLiteral("NUL"), [](QIODevice &device) { return device.write("text") == 4; }, &error))
        << error.toStdString();
}

} // namespace

#include "SystemPath.h"

#include "JobFolder.h"

#include <QDir>

#include <gtest/gtest.h>

#include <cstdio>
#include <filesystem>
#include <fstream>

namespace
{

// Letters of the system's own language, and of others, in the folder as well.
constexpr const char *names[] = {"plain.txt", "with blanks.txt",
                                 "Stra\xC3\x9F"
                                 "e.txt",
                                 "\xE6\xB8\xAC\xE9\x87\x8F/\xD0\xBF\xD0\xBB\xD0\xB0\xD0\xBD.txt"};

TEST(SystemPath, TheStandardLibraryWritesTheFileThatQtReads)
{
    for (const char *name : names) {
        const JobFolder folder;
        const QString path = folder.path(name);
        std::error_code error;
        std::filesystem::create_directories(kareport::standardPath(QFileInfo(path).path()), error);
        ASSERT_FALSE(error) << name << ": " << error.message();
        std::ofstream(kareport::standardPath(path)) << "text";
        EXPECT_EQ(folder.bytesOf(name), "text") << name;
    }
}

TEST(SystemPath, ALibraryFindsAFileByBytes)
{
    for (const char *name : names) {
        const JobFolder folder;
        QDir().mkpath(QFileInfo(folder.path(name)).path());
        folder.put(name, "text");
        std::FILE *file = std::fopen(kareport::pathForLibrary(folder.path(name)).constData(), "rb");
        ASSERT_NE(file, nullptr) << name;
        EXPECT_EQ(std::fgetc(file), 't') << name;
        std::fclose(file);
    }
}

TEST(SystemPath, AWordOfTheCommandLineIsTheTextThatItsBytesMean)
{
    for (const char *name : names) {
        EXPECT_EQ(kareport::textOfSystem(name), QString::fromUtf8(name)) << name;
    }
}

} // namespace

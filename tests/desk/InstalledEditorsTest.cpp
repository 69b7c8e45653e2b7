#include "InstalledEditors.h"

#include "JobFolder.h"

#include <gtest/gtest.h>

namespace
{

using kareport::installedEditors;

TEST(InstalledEditors, ListsProgramsThatOpenTexts)
{
    struct Row
    {
        const char *description;
        const char *name; ///< null where it is not listed
        const char *reason;
    };
    const Row rows[] = {
        {"[Desktop Entry]\nName=Pad\nExec=sh %F\nMimeType=text/plain;\n", "Pad", "a text editor"},
        {"[Desktop Entry]\nName=Word\nExec=sh\nMimeType=image/png;application/rtf\n", "Word", "rich text among others"},
        {"[Desktop Entry]\r\nName=Pad\r\nExec=sh\r\nMimeType=text/plain;\r\n", "Pad", "lines that end with CR LF"},
        {"[Desktop Entry]\nName = Pad \nExec = sh %f\nMimeType = text/plain;\n", "Pad", "blanks about the sign"},
        {"[Desktop Entry]\nName=Pad\nExec=\"/bin/sh\" -x\nMimeType=text/plain\n", "Pad", "a quoted program"},
        {"[Desktop Entry]\nName=Pic\nExec=sh\nMimeType=image/png;\n", nullptr, "opens no texts"},
        {"[Desktop Entry]\nName=Pic\nExec=sh\nMimeType=text/plaintiff;\n", nullptr, "the type is compared whole"},
        {"[Desktop Entry]\nName=Vi\nExec=sh\nTerminal=true\nMimeType=text/plain;\n", nullptr, "would have no window"},
        {"[Desktop Entry]\nName=H\nExec=sh\nNoDisplay=true\nMimeType=text/plain;\n", nullptr, "not to be shown"},
        {"[Desktop Entry]\nName=G\nExec=no-such-program-here\nMimeType=text/plain;\n", nullptr, "not installed"},
        {"[Desktop Entry]\nName=G\nMimeType=text/plain;\n", nullptr, "names no program"},
        {"[Other]\nName=G\nExec=sh\nMimeType=text/plain;\n", nullptr, "another group"},
        {"[Desktop Entry]\nName=Pad\nExec=sh\nMimeType=text/plain\n[Desktop Action New]\nName=New\nExec=gone\n", "Pad",
         "what follows in another group is about something else"},
        {"", nullptr, "an empty file"},
        {"\xFF\xFE[Desk", nullptr, "no text"},
    };
    for (const Row &row : rows) {
        const JobFolder folder;
        folder.put("a.desktop", row.description);
        folder.put("a.txt", "[Desktop Entry]\nName=T\nExec=sh\nMimeType=text/plain;\n");
        const auto editors = installedEditors({folder.path()});
        ASSERT_EQ(editors.size(), row.name == nullptr ? 0U : 1U) << row.reason;
        if (row.name != nullptr) {
            EXPECT_EQ(editors[0].name, QString::fromUtf8(row.name)) << row.reason;
            EXPECT_TRUE(editors[0].path.endsWith(QStringLiteral("/sh"))) << row.reason;
        }
    }
}

TEST(InstalledEditors, EarlierFoldersHideLaterOnesAndNamesAreSorted)
{
    const JobFolder own;
    const JobFolder system;
    own.put("b.desktop", "[Desktop Entry]\nName=Zed\nExec=sh\nMimeType=text/plain;\n");
    own.put("c.desktop", "[Desktop Entry]\nName=Hidden\nExec=sh\nNoDisplay=true\nMimeType=text/plain;\n");
    system.put("b.desktop", "[Desktop Entry]\nName=Old\nExec=sh\nMimeType=text/plain;\n");
    system.put("c.desktop", "[Desktop Entry]\nName=Shown\nExec=sh\nMimeType=text/plain;\n");
    system.put("a.desktop", "[Desktop Entry]\nName=Alpha\nExec=sh\nMimeType=text/plain;\n");
    QStringList names;
    for (const auto &editor : installedEditors({own.path(), system.path(), QStringLiteral("/no/such/folder")})) {
        names.append(editor.name);
    }
    EXPECT_EQ(names, QStringList({QStringLiteral("Alpha"), QStringLiteral("Zed")}))
        << "what the user hides is hidden, what he has changed is changed";
}

} // namespace

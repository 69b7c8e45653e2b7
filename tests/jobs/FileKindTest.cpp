#include "FileKind.h"

#include "JobFolder.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

namespace
{

using kareport::FileKind;

TEST(FileKind, TheEndingOfTheNameSaysIt)
{
    const struct
    {
        QStringView name;
        std::optional<FileKind> kind;
        const char *reason;
    } rows[] = {
        {u"a.json", FileKind::Job, "a job"},
        {u"a.JSON", FileKind::Job, "case does not matter"},
        {u"a.xml", FileKind::Template, "a template file"},
        {u"a.pdf", FileKind::Pdf, "a PDF"},
        {u"a.rtf", FileKind::RichText, "rich text"},
        {u"a.pdf.rtf", FileKind::RichText, "the last ending counts"},
        {u"a.rep", std::nullopt, "a report has any other name"},
        {u"a.json ", std::nullopt, "a blank after it"},
        {u"ajson", std::nullopt, "no point"},
        {u"-", std::nullopt, "standard input has no name"},
        {u"", std::nullopt, "no name"},
    };
    for (const auto &row : rows) {
        EXPECT_EQ(kareport::fileKindOf(row.name), row.kind) << row.reason;
    }
}

TEST(FileKind, AFileIsLookedIntoWhereItsNameDoesNotTell)
{
    const struct
    {
        const char *name;
        const char *content;
        bool isJob;
        bool isPdf;
        const char *reason;
    } rows[] = {
        {"a.json", "<x>", true, false, "the name says a job"},
        {"a.xml", "{}", false, false, "the name says a template"},
        {"a.txt", " \n{}", true, false, "a job begins with a brace"},
        {"a", "<x>", false, false, "neither"},
        {"a", "%PDF-1.3", false, true, "the first bytes of a PDF"},
        {"a", "%PDF", false, false, "cut off"},
        {"a.pdf", "text", false, true, "the name says a PDF"},
        {"a.pdf.pdf", "text", false, false, "the text of a report is saved under it"},
        {"a", "", false, false, "empty"},
    };
    for (const auto &row : rows) {
        const JobFolder folder;
        folder.put(row.name, row.content);
        EXPECT_EQ(kareport::isJobFile(folder.path(row.name)), row.isJob) << row.name << ": " << row.reason;
        EXPECT_EQ(kareport::isPdfFile(folder.path(row.name)), row.isPdf) << row.name << ": " << row.reason;
    }
    EXPECT_TRUE(kareport::isJobFile(QStringLiteral("-")));
    EXPECT_FALSE(kareport::isJobFile(QStringLiteral("/dev"))) << "a folder";
}

} // namespace

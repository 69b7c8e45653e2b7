#include "DataFiles.h"

#include "JobFolder.h"
#include "SqliteObjectList.h"

#include <QFile>

#include <gtest/gtest.h>

namespace
{

using kareport::DataFiles;
using Bytes = std::shared_ptr<const kareport::FileBytes>;

TEST(DataFiles, AllNamesOfAFileAreOne)
{
    const JobFolder folder;
    folder.put("a.csv", "Number\n1\n");
    folder.put("b.csv", "Number\n1\n");
    ASSERT_TRUE(QFile::link(folder.path("a.csv"), folder.path("link.csv")));
    struct Row
    {
        const char *name;
        bool isSame;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"a.csv", true, "the same name"},
        {"./a.csv", true, "with a folder in front"},
        {"link.csv", true, "a link to it"},
        {"b.csv", false, "another file, of the same content"},
    };
    for (const Row &row : rows) {
        DataFiles files;
        const QString name = folder.path() + u'/' + QString::fromUtf8(row.name);
        files.database(folder.path("a.csv")) = kareport::SqliteObjectList::openFile(folder.path("a.csv"));
        EXPECT_EQ(files.database(name) != nullptr, row.isSame) << row.reason;
        const auto first = files.open(folder.path("a.csv"));
        const auto second = files.open(name);
        ASSERT_FALSE(errorOf(first) != nullptr || errorOf(second) != nullptr) << row.reason;
        EXPECT_EQ(std::get<Bytes>(first) == std::get<Bytes>(second), row.isSame) << row.reason;
    }
}

} // namespace

#include "JobList.h"

#include "InputErrorText.h"
#include "JobFolder.h"

#include <gtest/gtest.h>

#include <limits>
#include <vector>

namespace
{

using kareport::JobSlice;

TEST(JobSlice, IsANumberASlashAndACount)
{
    struct Row
    {
        const char *text;
        qsizetype number; ///< 0 for none
        qsizetype count;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"1/1", 1, 1, "all"},
        {"3/8", 3, 8, "a part"},
        {"8/8", 8, 8, "the last part"},
        {"03/08", 3, 8, "names of files are often numbered so"},
        {"9223372036854775807/9223372036854775807", std::numeric_limits<qsizetype>::max(),
         std::numeric_limits<qsizetype>::max(), "the largest"},
        {"0/8", 0, 0, "counted from 1"},
        {"9/8", 0, 0, "beyond the count"},
        {"", 0, 0, "empty"},
        {"3", 0, 0, "no count"},
        {"3/", 0, 0, "an empty count: a variable that is not set"},
        {"/8", 0, 0, "an empty number: a variable that is not set"},
        {"/", 0, 0, "both empty"},
        {"-1/8", 0, 0, "negative"},
        {"+1/8", 0, 0, "a sign"},
        {" 1/8", 0, 0, "a blank"},
        {"1/8 ", 0, 0, "a blank after it"},
        {"1/8/2", 0, 0, "two slashes"},
        {"a/b", 0, 0, "no numbers"},
        {"1.5/3", 0, 0, "a broken number"},
        {"\xD9\xA1/\xD9\xA2", 0, 0, "digits of another script"},
        {"9223372036854775808/9223372036854775808", 0, 0, "more than a number holds"},
    };
    for (const Row &row : rows) {
        const auto slice = JobSlice::fromText(QString::fromUtf8(row.text));
        ASSERT_EQ(slice.has_value(), row.number != 0) << row.text << ": " << row.reason;
        if (slice) {
            EXPECT_EQ(slice->number, row.number) << row.reason;
            EXPECT_EQ(slice->count, row.count) << row.reason;
        }
    }
}

TEST(JobSlice, TakesEveryNthJob)
{
    struct Row
    {
        JobSlice slice;
        const char *jobs;
        const char *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {{1, 1}, "a b c", "a b c", "one slice has all"},
        {{1, 2}, "a b c d e", "a c e", "the first of two"},
        {{2, 2}, "a b c d e", "b d", "the second of two"},
        {{3, 8}, "a b", "", "fewer jobs than slices"},
        {{2, 8}, "a b", "b", "the last job"},
        {{1, 2}, "", "", "no job"},
        {{1, std::numeric_limits<qsizetype>::max()}, "a b", "a", "as many slices as a number holds"},
        {{std::numeric_limits<qsizetype>::max(), std::numeric_limits<qsizetype>::max()}, "a b", "", "the last of them"},
    };
    const auto list = [](const char *names) { return QString::fromUtf8(names).split(u' ', Qt::SkipEmptyParts); };
    for (const Row &row : rows) {
        EXPECT_EQ(row.slice.of(list(row.jobs)), list(row.expected)) << row.reason;
    }
}

TEST(JobSlice, AllSlicesHaveEachJobOnceBetweenThem)
{
    for (qsizetype jobs = 0; jobs < 14; ++jobs) {
        QStringList all;
        for (qsizetype i = 0; i < jobs; ++i) {
            all.append(QString::number(100 + i));
        }
        for (qsizetype count = 1; count < 16; ++count) {
            QStringList taken;
            for (qsizetype number = 1; number <= count; ++number) {
                taken += JobSlice{number, count}.of(all);
            }
            taken.sort();
            EXPECT_EQ(taken, all) << jobs << " jobs in " << count << " slices";
        }
    }
}

TEST(JobList, HasANameOnEachLine)
{
    struct Row
    {
        QByteArray content;
        QStringList expected;
        const char *reason;
    };
    const Row rows[] = {
        {"", {}, "an empty list"},
        {"\n\n \n", {}, "blank lines"},
        {"a.json", {"a.json"}, "no line end after the last"},
        {"a.json\nb.json\n", {"a.json", "b.json"}, "two"},
        {"a.json\r\nb.json\r\n", {"a.json", "b.json"}, "line ends of another system"},
        {"jobs/my road.json\n", {"jobs/my road.json"}, "a blank in a name"},
        {" a.json \n", {" a.json "}, "blanks belong to a name"},
        {"\xC3\xA4\xE7\xB7\x9A\xF0\x9F\x98\x80.json\n",
         {QString::fromUtf8("\xC3\xA4\xE7\xB7\x9A\xF0\x9F\x98\x80.json")},
         "names in UTF-8"},
        {QByteArray("a\nb.json\0c.json\0", 16), {"a\nb.json", "c.json"}, "names with a line end, ended by 0 bytes"},
        {QByteArray("a.json\0b.json", 13), {"a.json", "b.json"}, "no 0 byte after the last"},
        {QByteArray("a.json\0\n", 8), {"a.json"}, "a line end after the last 0 byte"},
        {"#a.json\n", {"#a.json"}, "no comments: a name may begin so"},
    };
    const JobFolder folder;
    for (const Row &row : rows) {
        folder.put("jobs.txt", row.content);
        const auto jobs = kareport::readJobList(folder.path("jobs.txt"));
        ASSERT_EQ(kareport::errorOf(jobs), nullptr) << row.reason;
        EXPECT_EQ(std::get<QStringList>(jobs), row.expected) << row.reason;
    }
}

TEST(JobList, ACharacter0InALineIsAnError)
{
    const JobFolder folder;
    for (const QByteArray &content : {QByteArray("a.json\nb\0.json\nc.json\n", 22), QByteArray("a.json\nb\0.json", 14)})
    {
        folder.put("jobs.txt", content);
        const auto jobs = kareport::readJobList(folder.path("jobs.txt"));
        const auto *error = kareport::errorOf(jobs);
        ASSERT_NE(error, nullptr) << "a name that would be parted";
        EXPECT_EQ(placeText(error->place), QStringLiteral("2:2"));
        EXPECT_TRUE(error->text.contains(u"both line breaks and NUL characters")) << error->text.toStdString();
    }
}

TEST(JobList, AListThatCannotBeReadIsAnError)
{
    const JobFolder folder;
    for (const QString &path : {folder.path("none.txt"), folder.path()}) {
        const auto jobs = kareport::readJobList(path);
        const auto *error = kareport::errorOf(jobs);
        ASSERT_NE(error, nullptr) << qPrintable(path);
        EXPECT_TRUE(error->message().startsWith(path + QStringLiteral(": error: the list of jobs cannot be read: ")))
            << qPrintable(error->message());
    }
}

} // namespace

#include "CsvFile.h"
#include "FileBytes.h"
#include "InputErrorText.h"
#include "Interrupt.h"
#include "MappedMemory.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <thread>

namespace
{

using kareport::FileBytes;

/// Rows of 2 MB: enough for a file that is mapped.
QByteArray manyRows()
{
    return "Number,Northing\n" + QByteArray("1,12.5\n").repeated(300'000);
}

constexpr const char *cutShort = "the file was cut short while it was read";

TEST(FileBytesPosix, WhatIsCutOffReadsAsZerosAndIsSaid)
{
    struct Row
    {
        off_t left;
        const char *reason;
    };
    constexpr Row rows[] = {
        {0, "nothing is left"},
        {100, "within the first page"},
        {1'000'000, "in the middle"},
        {2'100'000, "within the last page, which the system does not report"},
    };
    for (const Row &row : rows) {
        const JobFolder folder;
        const QByteArray content = manyRows();
        folder.put("f.csv", content);
        const auto opened = FileBytes::open(folder.path("f.csv"));
        const auto &bytes = std::get<std::shared_ptr<const FileBytes>>(opened);
        ASSERT_EQ(bytes->view().size(), std::size_t(content.size()));
        EXPECT_FALSE(bytes->lostBytes());
        ASSERT_EQ(truncate(qPrintable(folder.path("f.csv")), row.left), 0);
        const std::string_view view = bytes->view();
        EXPECT_EQ(view.substr(0, std::size_t(row.left)), std::string_view(content.constData(), std::size_t(row.left)))
            << row.reason;
        EXPECT_TRUE(std::all_of(view.begin() + row.left, view.end(), [](char byte) { return byte == '\0'; }))
            << row.reason;
        ASSERT_TRUE(bytes->lostBytes()) << row.reason;
        EXPECT_EQ(bytes->lostBytes()->text, QString::fromUtf8(cutShort)) << row.reason;
    }
}

TEST(FileBytesPosix, ACutFileIsAnErrorOfItsOwnList)
{
    for (const bool isSorted : {false, true}) {
        csv::CsvFile cut(manyRows());
        csv::CsvFile whole(manyRows());
        ASSERT_NE(cut.list->GetAt(0), nullptr);
        ASSERT_EQ(truncate(qPrintable(cut.path()), 1'000'000), 0);
        if (isSorted) {
            cut.list->Sort({csv::northingId});
        }
        std::size_t rows = 0;
        while (cut.list->GetAt(rows) != nullptr) {
            ++rows;
        }
        EXPECT_LT(rows, 300'000U);
        EXPECT_EQ(textOfError(cut.list->error()), QString::fromUtf8(cutShort)) << isSorted;
        EXPECT_EQ(placeText(cut.list->error()), QStringLiteral("none"));
        rows = 0;
        while (whole.list->GetAt(rows) != nullptr) {
            ++rows;
        }
        EXPECT_EQ(rows, 300'000U);
        EXPECT_FALSE(whole.list->error()) << "another file is not touched";
    }
}

TEST(FileBytesPosix, MoreFilesThanCanBeGuardedAreRead)
{
    const JobFolder folder;
    folder.put("f.csv", manyRows());
    std::vector<std::shared_ptr<const FileBytes>> files;
    for (int i = 0; i < 100; ++i) {
        const auto opened = FileBytes::open(folder.path("f.csv"));
        ASSERT_EQ(errorOf(opened), nullptr) << i;
        files.push_back(std::get<std::shared_ptr<const FileBytes>>(opened));
        EXPECT_EQ(files.back()->view().size(), std::size_t(manyRows().size())) << i;
    }
}

TEST(FileBytesPosix, APipeIsReadToItsEndHoweverMuchComes)
{
    for (const qsizetype size :
         {qsizetype(0), qsizetype(1), qsizetype(65'536), qsizetype(65'537), qsizetype(3'000'000)}) {
        const JobFolder folder;
        const QByteArray content(size, 'x');
        const QByteArray name = QFile::encodeName(folder.path("pipe"));
        ASSERT_EQ(mkfifo(name.constData(), 0600), 0);
        std::jthread writer([&] {
            QFile file(folder.path("pipe"));
            EXPECT_TRUE(file.open(QIODevice::WriteOnly) && file.write(content) == size);
        });
        const auto opened = FileBytes::open(folder.path("pipe"));
        ASSERT_EQ(errorOf(opened), nullptr);
        const auto view = std::get<std::shared_ptr<const FileBytes>>(opened)->view();
        EXPECT_EQ(view, std::string_view(content.constData(), std::size_t(size)));
    }
}

TEST(FileBytesPosix, WhatIsReleasedLeavesTheMemoryAndCanBeReadAgain)
{
    const JobFolder folder;
    constexpr std::size_t block = std::size_t(1) << 16;
    constexpr std::size_t size = 1000 * block;
    folder.put("f", QByteArray("0123456789abcdef").repeated(size / 16));
    const auto opened = FileBytes::open(folder.path("f"));
    const auto &bytes = std::get<std::shared_ptr<const FileBytes>>(opened);
    const double before = mappedMegabytes();
    double most = 0;
    for (std::size_t at = 0; at < size; at += block) {
        EXPECT_EQ(std::count(bytes->view().begin() + std::ptrdiff_t(at),
                             bytes->view().begin() + std::ptrdiff_t(at + block), 'a'),
                  std::ptrdiff_t(block / 16));
        bytes->release(at);
        most = std::max(most, mappedMegabytes() - before);
    }
    EXPECT_LT(most, 12) << "of 62";
    EXPECT_EQ(std::count(bytes->view().begin(), bytes->view().end(), 'f'), std::ptrdiff_t(size / 16)) << "read again";
}

TEST(FileBytesPosix, BytesInMemoryNeedNoFile)
{
    const auto bytes = FileBytes::holding(QStringLiteral("no such file"), "abc");
    EXPECT_EQ(bytes->view(), "abc");
    EXPECT_EQ(bytes->path(), QStringLiteral("no such file"));
    EXPECT_FALSE(bytes->lostBytes());
    bytes->release(3);
    EXPECT_EQ(bytes->view(), "abc");
}

/// Lets a file be the standard input of the program.
class StandardInput
{
public:
    explicit StandardInput(int handle) : before_(dup(STDIN_FILENO)) { dup2(handle, STDIN_FILENO); }
    ~StandardInput()
    {
        dup2(before_, STDIN_FILENO);
        close(before_);
    }
    StandardInput(const StandardInput &) = delete;
    StandardInput &operator=(const StandardInput &) = delete;

private:
    int before_;
};

TEST(FileBytesPosix, StandardInputIsReadFromWhereItIs)
{
    for (const qsizetype size : {qsizetype(0), qsizetype(100), qsizetype(3'000'000)}) {
        for (const off_t start : {off_t(0), off_t(7)}) {
            const JobFolder folder;
            const QByteArray content = "skipped" + QByteArray(size, 'x');
            folder.put("f.csv", content);
            const int handle = open(qPrintable(folder.path("f.csv")), O_RDONLY);
            ASSERT_EQ(lseek(handle, start, SEEK_SET), start);
            const StandardInput input(handle);
            const auto opened = FileBytes::openStandardInput();
            ASSERT_EQ(errorOf(opened), nullptr);
            const auto &bytes = std::get<std::shared_ptr<const FileBytes>>(opened);
            EXPECT_EQ(bytes->path(), QStringLiteral("-"));
            EXPECT_EQ(bytes->view().size(), std::size_t(content.size() - start)) << "as a file from " << start;
            EXPECT_FALSE(bytes->lostBytes());
            close(handle);
        }
        int ends[2] = {};
        ASSERT_EQ(pipe(ends), 0);
        std::jthread writer([&] {
            QFile file;
            EXPECT_TRUE(file.open(ends[1], QIODevice::WriteOnly, QFileDevice::AutoCloseHandle));
            EXPECT_EQ(file.write(QByteArray(size, 'y')), size);
        });
        const StandardInput input(ends[0]);
        const auto opened = FileBytes::openStandardInput();
        ASSERT_EQ(errorOf(opened), nullptr);
        EXPECT_EQ(std::get<std::shared_ptr<const FileBytes>>(opened)->view().size(), std::size_t(size)) << "as a pipe";
        close(ends[0]);
    }
}

} // namespace

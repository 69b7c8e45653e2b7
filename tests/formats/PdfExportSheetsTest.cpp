#include "PdfFixture.h"

#include <gtest/gtest.h>

// Pages that are longer and lines that are wider than a sheet.

namespace
{

using kareport::PdfNotes;
using kareport::PdfOptions;

QString lines(int count, const char *what = "line")
{
    QString text;
    for (int line = 1; line <= count; ++line) {
        text += QString::fromUtf8(what) + QString::number(line) + QStringLiteral("\r\n");
    }
    return text;
}

/// The type size of a page in DejaVu Sans Mono, by the width of a word.
double typeSize(const PdfWord &word)
{
    return (word.right - word.left) / (0.602 * static_cast<double>(word.text.size()));
}

TEST(PdfExportSheets, APageOfTheReportIsAPage)
{
    const QString first = lines(3, "a");
    const QString second = lines(60, "b");
    PdfOptions options = pdfOptions();
    options.pageStarts = {0, first.size(), first.size() + second.size()};
    const PdfReadBack pdf(pdfBytes(QString(first + second + lines(2, "c")), options));
    ASSERT_EQ(pdf.pageCount(), 3);
    EXPECT_EQ(pdf.pages()[0], QStringLiteral("a1\na2\na3")) << "a short page ends where the next begins";
    EXPECT_EQ(pdf.pages()[2], QStringLiteral("c1\nc2"));
}

TEST(PdfExportSheets, ALongPageAloneIsSetSmaller)
{
    struct Row
    {
        int lines;
        std::vector<int> sheets; ///< the lines of each
        double size;             ///< points
        const char *reason;
    };
    // The box is 769.92 points high; a line is 1.402 em, and 60 of 9 points have room at that.
    const Row rows[] = {
        {60, {60}, 9, "as many as a page has"},
        {61, {61}, 9, "there is room for more"},
        {100, {100}, 769.92 / (100 * 1.402), "smaller"},
        {109, {109}, 769.92 / (109 * 1.402), "nearly as small as it may be"},
        {110, {109, 1}, 5, "not below 5 points: what is left goes on"},
        {300, {109, 109, 82}, 5, "as often as needed"},
    };
    for (const Row &row : rows) {
        const QString before = lines(60, "a");
        const QString page = lines(row.lines);
        PdfOptions options = pdfOptions();
        options.pageStarts = {0, before.size(), before.size() + page.size()};
        PdfNotes notes;
        const PdfReadBack pdf(pdfBytes(QString(before + page + lines(60, "z")), options, &notes));
        ASSERT_EQ(pdf.pageCount(), static_cast<int>(row.sheets.size()) + 2) << row.reason;
        int line = 1;
        for (std::size_t sheet = 0; sheet < row.sheets.size(); ++sheet) {
            const std::vector<PdfWord> words = pdf.words(static_cast<int>(sheet) + 2);
            ASSERT_EQ(words.size(), static_cast<std::size_t>(row.sheets[sheet])) << row.reason;
            EXPECT_EQ(words.front().text, QStringLiteral("line%1").arg(line)) << row.reason;
            EXPECT_NEAR(typeSize(words.front()), row.size, 0.02) << row.reason;
            EXPECT_LE(words.back().bottom, 841.92 - 36 + 0.01) << row.reason;
            line += row.sheets[sheet];
        }
        EXPECT_NEAR(typeSize(pdf.words(1).front()), 9, 0.01) << row.reason << ": the page before";
        EXPECT_NEAR(typeSize(pdf.words(pdf.pageCount()).front()), 9, 0.01) << row.reason << ": the page after";
        EXPECT_TRUE(notes.warnings().isEmpty()) << row.reason << ": nothing is lost";
    }
}

TEST(PdfExportSheets, TheWidestLineDecidesTheTypeSize)
{
    struct Row
    {
        int cells;
        double size; ///< points
        int pieces;
        QString warning;
        const char *reason;
    };
    // There are 523.32 points of room: 96 characters of 9 points, 173 of 5.
    const Row rows[] = {
        {96, 9, 1, {}, "it fits"},
        {97, 523.32 / (97 * 0.602), 1,
         QStringLiteral("line 61 is wider than the page: the type is 8.96 points on all pages"),
         "a character too wide"},
        {150, 523.32 / (150 * 0.602), 1,
         QStringLiteral("line 61 is wider than the page: the type is 5.8 points on all pages"), "much too wide"},
        {173, 523.32 / (173 * 0.602), 1,
         QStringLiteral("line 61 is wider than the page: the type is 5.02 points on all pages"), "just fits"},
        {174, 5, 2,
         QStringLiteral(
             "line 61 is wider than the page: the type is 5 points on all pages|line 61 is wider than the page in "
             "type of 5 points: what is too wide continues below"),
         "not below 5 points"},
    };
    for (const Row &row : rows) {
        PdfNotes notes;
        const QString text = lines(60) + QString(row.cells, u'x') + QStringLiteral("\r\nend\r\n");
        const PdfReadBack pdf(pdfBytes(text, pdfOptions(), &notes));
        ASSERT_EQ(pdf.pageCount(), 2) << row.reason;
        const std::vector<PdfWord> words = pdf.words(2);
        ASSERT_EQ(words.size(), static_cast<std::size_t>(row.pieces) + 1) << row.reason;
        EXPECT_NEAR(typeSize(words.front()), row.size, 0.01) << row.reason;
        EXPECT_LE(words.front().right, 595.32 - 36 + 0.01) << row.reason;
        EXPECT_NEAR(typeSize(pdf.words(1).front()), row.size, 0.02) << row.reason << ": all pages";
        EXPECT_EQ(notes.warnings().join(u'|'), row.warning) << row.reason;
    }
    PdfNotes notes;
    pdfBytes(QString(QString(100, u'x') + QStringLiteral("\na\n") + QString(110, u'x')), pdfOptions(), &notes);
    EXPECT_EQ(notes.warnings(),
              QStringList{QStringLiteral("2 lines, the first of them line 1, are wider than the page: "
                                         "the type is 7.9 points on all pages")});
}

TEST(PdfExportSheets, WideCharactersCountTwice)
{
    PdfNotes notes;
    pdfBytes(QStringLiteral("測").repeated(48), pdfOptions(), &notes);
    EXPECT_TRUE(notes.warnings().isEmpty()) << "96 cells";
    pdfBytes(QStringLiteral("測").repeated(49), pdfOptions(), &notes);
    EXPECT_EQ(notes.reduced.count, 1) << "98 cells";
    PdfNotes marks;
    pdfBytes(QStringLiteral("x\u0304").repeated(96), pdfOptions(), &marks);
    EXPECT_TRUE(marks.warnings().isEmpty()) << "marks take none";
}

TEST(PdfExportSheets, BrokenLinesOfAPageGoOnOnFurtherSheets)
{
    QString text;
    for (int line = 0; line < 60; ++line) {
        text += QString(400, QChar(u'a' + line % 26)) + QStringLiteral("\r\n");
    }
    const PdfReadBack pdf(pdfBytes(text, pdfOptions()));
    EXPECT_EQ(pdf.pageCount(), 2) << "180 lines of 5 points, 109 of them on a sheet";
    EXPECT_EQ(pdf.characters(), QString(text).remove(u'\r').remove(u'\n'));
}

TEST(PdfExportSheets, APageWithoutAnEndGetsTypeThatCanBeRead)
{
    // 100000 lines a page mean that there are to be no pages.
    PdfOptions options = pdfOptions();
    options.page.linesPerPage = 100000;
    const PdfReadBack few(pdfBytes(lines(50), options));
    EXPECT_EQ(few.pageCount(), 1);
    EXPECT_NEAR(typeSize(few.words().front()), 9, 0.01);
    const PdfReadBack many(pdfBytes(lines(1000), options));
    EXPECT_GT(many.pageCount(), 1);
    EXPECT_NEAR(typeSize(many.words().front()), 5, 0.01);
}

} // namespace

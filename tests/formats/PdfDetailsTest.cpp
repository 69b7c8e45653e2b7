#include "CompressedFaces.h"
#include "KeptDocument.h"
#include "PdfFixture.h"

#include <gtest/gtest.h>

// What a PDF says of itself, read back.

namespace
{

using kareport::OutlineEntry;
using kareport::PdfDetails;
using kareport::PdfOptions;

PdfDetails allDetails()
{
    PdfDetails details;
    details.title = QStringLiteral("Setting out");
    details.author = QStringLiteral("A. Surveyor");
    details.creator = QStringLiteral("TALVEN Survey");
    details.created = QDateTime(QDate(2024, 3, 5), QTime(14, 7, 9));
    details.language = QStringLiteral("en-GB");
    return details;
}

QByteArray detailedPdf(const QString &text, const PdfDetails &details, std::vector<OutlineEntry> outline = {},
                       PdfOptions options = pdfOptions())
{
    options.details = &details;
    options.outline = std::move(outline);
    return pdfBytes(text, options);
}

/// Lines of 5 characters, with their line ends.
QString lines(int count)
{
    QString text;
    for (int line = 0; line < count; ++line) {
        text += QStringLiteral("%1\r\n").arg(line, 3, 10, QLatin1Char('0'));
    }
    return text;
}

TEST(PdfDetails, AreWhatReadersShow)
{
    struct Row
    {
        QString title;
        QString author;
        const char *reason;
    };
    const Row rows[] = {
        {QStringLiteral("Setting out"), QStringLiteral("A. Surveyor"), "ASCII"},
        {QStringLiteral("測量の結果"), QStringLiteral("山田 太郎"), "Japanese"},
        {QStringLiteral("Höhenplan (1:500) \\ „A“"), QStringLiteral("Jürgen Groß"), "what strings of a PDF escape"},
        {QStringLiteral("a \U0001D538 b"), QStringLiteral("😀"), "beyond U+FFFF"},
        {QString(), QString(), "nothing"},
    };
    for (const Row &row : rows) {
        PdfDetails details = allDetails();
        details.title = row.title;
        details.author = row.author;
        const PdfReadBack pdf(detailedPdf(QStringLiteral("line\r\n"), details));
        EXPECT_EQ(pdf.info("Title"), row.title) << row.reason;
        EXPECT_EQ(pdf.info("Author"), row.author) << row.reason;
        EXPECT_EQ(pdf.info("Creator"), QStringLiteral("TALVEN Survey")) << row.reason;
        EXPECT_EQ(pdf.check(), QString()) << row.reason;
    }
}

TEST(PdfDetails, AnEndlessTextIsCut)
{
    PdfDetails details;
    details.title = QString(15'999, u'x') + QStringLiteral("😀").repeated(20'000);
    const PdfReadBack pdf(detailedPdf(QStringLiteral("line\r\n"), details));
    EXPECT_EQ(pdf.info("Title"), QString(15'999, u'x')) << "before half a character";
}

TEST(PdfDetails, TimeAndLanguageAreInTheFile)
{
    const QByteArray objects = PdfReadBack(detailedPdf(QStringLiteral("line\r\n"), allDetails())).objects();
    EXPECT_TRUE(objects.contains("/CreationDate (D:20240305140709)")) << objects.constData();
    EXPECT_TRUE(objects.contains("/Lang (en-GB)"));
    EXPECT_TRUE(objects.startsWith("%PDF-1.4")) << "the first version that has a language";
    const QByteArray others = PdfReadBack(detailedPdf(QStringLiteral("line\r\n"), PdfDetails())).objects();
    EXPECT_FALSE(others.contains("/CreationDate"));
    EXPECT_FALSE(others.contains("/Lang"));
    EXPECT_FALSE(others.contains("/Title"));
    EXPECT_FALSE(others.contains("/Outlines")) << "of a report without entries";
}

TEST(PdfDetails, WithoutThemThereAreThePagesAlone)
{
    PdfOptions options = pdfOptions();
    options.outline = {{0, QStringLiteral("Points"), 0}};
    const QString text = lines(120);
    EXPECT_TRUE(pdfBytes(text, options) == pdfBytes(text, pdfOptions()));
    const QByteArray objects = PdfReadBack(pdfBytes(text, options)).objects();
    for (const char *key : {"/Outlines", "/PageLabels", "/PageMode", "/CreationDate", "/Lang", "/Title"}) {
        EXPECT_FALSE(objects.contains(key)) << key;
    }
}

TEST(PdfDetails, TheOutlineLeadsToPages)
{
    struct Row
    {
        std::vector<OutlineEntry> entries; ///< at lines of 5 characters, CR LF among them, 60 on a page
        const char *expected;
        const char *reason;
    };
    const auto at = [](int page, int line) { return qint64(300) * (page - 1) + qint64(5) * (line - 1); };
    const auto entry = [](int level, const char *text, qint64 place) {
        return OutlineEntry{level, QString::fromUtf8(text), place};
    };
    const Row rows[] = {
        {{entry(0, "Points", 0)}, "Points 1\n", "one heading"},
        {{entry(0, "A", at(1, 3)), entry(0, "B", at(2, 1)), entry(0, "C", at(3, 60))},
         "A 1\nB 2\nC 3\n",
         "first and last lines of pages"},
        {{entry(0, "A", at(1, 1)), entry(1, "T", at(1, 5)), entry(2, "1", at(2, 5)), entry(2, "2", at(2, 9)),
          entry(1, "U", at(3, 5))},
         "A 1\n  T 1…\n    1 2\n    2 2\n  U 3\n",
         "groups of a table, which are not shown at first"},
        {{entry(1, "T", at(1, 1)), entry(1, "U", at(2, 5))}, "T 1\nU 2\n", "tables without a heading"},
        {{entry(3, "g", at(1, 1)), entry(2, "f", at(1, 2)), entry(3, "h", at(1, 3))},
         "g 1\nf 1…\n  h 1\n",
         "groups without a table, levels left out"},
        {{entry(0, "A", at(1, 1)), entry(1, "T", at(1, 5)), entry(0, "", at(2, 2)), entry(1, "U", at(2, 2))},
         "A 1\n  T 1\nU 2\n",
         "a heading that was taken back"},
        {{entry(0, "A", at(1, 4)), entry(1, "T", at(1, 4)), entry(1, "U", at(1, 4) + 2)},
         "A 1\n  T 1\n  U 1\n",
         "on one line"},
        {{entry(0, " 測量\r\n \t結果 ", at(2, 1))}, "測量 結果 2\n", "on one line, in any characters"},
        {{entry(0, "A", at(3, 60) + 5)}, "", "after the text"},
        {{}, "", "none"},
    };
    const QString even = lines(180);
    for (const Row &row : rows) {
        const PdfReadBack pdf(detailedPdf(even, PdfDetails(), row.entries));
        EXPECT_EQ(pdf.outline(), QString::fromUtf8(row.expected)) << row.reason;
        EXPECT_EQ(pdf.check(), QString()) << row.reason;
        QStringList texts;
        for (const QString &line : pdf.outline().split(u'\n', Qt::SkipEmptyParts)) {
            texts.append(line.trimmed().section(u' ', 0, -2));
        }
        EXPECT_EQ(pdf.outlineTexts(), texts) << row.reason;
    }
    PdfDetails without;
    without.hasOutline = false;
    EXPECT_EQ(PdfReadBack(detailedPdf(even, without, {entry(0, "A", 0)})).outline(), QString());
}

TEST(PdfDetails, TheOutlineLeadsToLines)
{
    // 60 lines in a box from 36 points to 36 points below 841.92 (7016 dots at 600 dpi).
    const PdfReadBack pdf(detailedPdf(QStringLiteral("ab\r\n").repeated(60), PdfDetails(),
                                      {{0, QStringLiteral("A"), 0}, {0, QStringLiteral("B"), 4 * 30}}));
    const QByteArray objects = pdf.objects().simplified();
    EXPECT_TRUE(objects.contains("/XYZ 0 841.91998 0 ]")) << "the page's top, with its margin: " << objects.constData();
    const std::vector<PdfWord> words = pdf.words();
    ASSERT_EQ(words.size(), 60U);
    const auto begin = objects.indexOf("/XYZ 0 ", objects.indexOf("/XYZ 0 841.91998 0 ]") + 10) + 7;
    const double top = objects.mid(begin, objects.indexOf(' ', begin) - begin).toDouble();
    EXPECT_GE(841.92 - top, words[29].bottom - 4) << "not the line before";
    EXPECT_LE(841.92 - top, words[30].top + 2);
}

TEST(PdfDetails, PagesHaveTheNumbersOfTheReport)
{
    const auto header = [](int page) {
        return QStringLiteral("TALVEN - T          Mar 05, 2024  02:07PM    Page:%1\r\n").arg(page, 3);
    };
    const auto page = [&header](int number) { return header(number) + QStringLiteral("x\r\n").repeated(59); };
    const QString plain = QStringLiteral("x\r\n").repeated(60);
    struct Row
    {
        QString text;
        const char *expected;
        const char *reason;
    };
    const Row rows[] = {
        {page(1) + page(2) + page(3), "1 2 3", "from 1"},
        {page(7) + page(8), "7 8", "from where the report begins"},
        {page(1) + page(2) + page(1) + page(2), "1 2 1 2", "two reports"},
        {plain + plain, "1 2", "without headers"},
        {plain + page(5) + plain, "1 5 6", "with some"},
    };
    for (const Row &row : rows) {
        const PdfReadBack pdf(detailedPdf(row.text, PdfDetails()));
        EXPECT_EQ(pdf.labels().join(u' '), QString::fromUtf8(row.expected)) << row.reason;
        EXPECT_EQ(pdf.check(), QString()) << row.reason;
    }
    PdfDetails without;
    without.hasPageLabels = false;
    EXPECT_TRUE(PdfReadBack(detailedPdf(plain, without)).labels().isEmpty());
}

TEST(PdfDetails, AContinuedPageKeepsItsNumber)
{
    PdfOptions options = pdfOptions();
    options.pageStarts = {0, 3000, 3030};
    const QString text =
        QStringLiteral("x\r\n").repeated(1000) + QStringLiteral("x\r\n").repeated(10) + QStringLiteral("y\r\n");
    const PdfReadBack pdf(
        detailedPdf(text, PdfDetails(), {{0, QStringLiteral("A"), 0}, {0, QStringLiteral("B"), 3000}}, options));
    const QStringList labels = pdf.labels();
    ASSERT_GT(labels.size(), 4);
    EXPECT_EQ(labels.size(), pdf.pageCount());
    EXPECT_EQ(labels[0], QStringLiteral("1"));
    EXPECT_EQ(labels[1], QStringLiteral("1-2"));
    EXPECT_EQ(labels[labels.size() - 3], QStringLiteral("1-%1").arg(labels.size() - 2));
    EXPECT_EQ(labels[labels.size() - 2], QStringLiteral("2"));
    EXPECT_EQ(labels[labels.size() - 1], QStringLiteral("3"));
    EXPECT_EQ(pdf.outline(), QStringLiteral("A 1\nB %1\n").arg(labels.size() - 1));
}

TEST(PdfDetails, TheSecondPdfOfAProcessHasTheBytesOfTheFirst)
{
    const QString text = QStringLiteral("P1 100.250 m\r\n測量 ∞\r\n");
    const auto forgetFaces = [] {
        kareport::CompressedFaces &kept = kareport::CompressedFaces::ofProcess();
        kept.keep(QByteArray(kareport::CompressedFaces::mostBytes - 1, 'x'), "y");
        EXPECT_EQ(kept.size(), kareport::CompressedFaces::mostBytes);
        kareport::KeptDocuments::ofProcess().clear();
    };
    forgetFaces();
    const QByteArray first = pdfBytes(text);
    const QByteArray second = pdfBytes(text);
    EXPECT_LT(kareport::CompressedFaces::ofProcess().size(), kareport::CompressedFaces::mostBytes) << "faces are kept";
    pdfBytes(QStringLiteral("other characters\r\n"));
    EXPECT_TRUE(second == first);
    EXPECT_TRUE(pdfBytes(text) == first) << "after another one";
    forgetFaces();
    EXPECT_TRUE(pdfBytes(text) == first) << "with nothing kept";
}

} // namespace

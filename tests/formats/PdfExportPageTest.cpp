#include "PdfFixture.h"

#include <gtest/gtest.h>

#include <hpdf.h>

// Sheet, faces and places of a PDF.

namespace
{

using kareport::PdfOptions;

TEST(PdfExportPage, TheSheetHasTheSizeOfThePrintersPage)
{
    struct Row
    {
        QSize pageSize;
        unsigned resolution;
        QStringView expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {QSize(5100, 6600), 600, u"612 x 792 pts (letter)", "Letter"},
        {QSize(4961, 7016), 600, u"595.32 x 841.92 pts (A4)", "A4"},
        {QSize(7016, 4961), 600, u"841.92 x 595.32 pts (A4)", "on its side"},
        {QSize(100, 300), 72, u"100 x 300 pts", "a slip"},
        {QSize(14400, 14400), 72, u"14400 x 14400 pts", "the largest that a PDF has"},
    };
    for (const Row &row : rows) {
        PdfOptions options = pdfOptions();
        options.page.pageSize = row.pageSize;
        options.page.resolution = row.resolution;
        const PdfReadBack pdf(pdfBytes(u"A\r\n", options));
        EXPECT_EQ(pdf.pageSize(), row.expected.toString()) << row.reason;
    }
}

/// Sets a text as the library itself does it in one call, in DejaVu Sans Mono.
QByteArray libraryPdf(const QByteArray &text, const PdfOptions &options)
{
    const kareport::PdfPageBox box = kareport::pdfPageBox(options.page);
    HPDF_Doc pdf = HPDF_New(nullptr, nullptr);
    HPDF_UseUTFEncodings(pdf);
    HPDF_SetCurrentEncoder(pdf, "UTF-8");
    const char *name = HPDF_LoadTTFontFromFile(pdf, QFile::encodeName(dejaVuFile()).constData(), HPDF_TRUE);
    const HPDF_Font font = HPDF_GetFont(pdf, name, "UTF-8");
    const HPDF_Page page = HPDF_AddPage(pdf);
    HPDF_Page_SetWidth(page, box.width);
    HPDF_Page_SetHeight(page, box.height);
    HPDF_Page_SetFontAndSize(page, font, static_cast<float>(options.page.fontSize));
    HPDF_Page_BeginText(page);
    HPDF_Page_TextRect(page, box.left, box.top, box.right, box.bottom, text.constData(), HPDF_TALIGN_LEFT, nullptr);
    HPDF_Page_EndText(page);
    HPDF_SaveToStream(pdf);
    HPDF_UINT32 size = HPDF_GetStreamSize(pdf);
    QByteArray bytes(size, '\0');
    HPDF_ReadFromStream(pdf, reinterpret_cast<HPDF_BYTE *>(bytes.data()), &size);
    HPDF_Free(pdf);
    return bytes;
}

TEST(PdfExportPage, TextThatFitsIsWhereTheLibraryPutsIt)
{
    struct Row
    {
        QByteArray text;
        QMargins margins;
        unsigned fontSize;
        const char *reason;
    };
    const Row rows[] = {
        {"A\n", QMargins(1270, 1270, 1270, 1270), 9, "the left edge at 36 points"},
        {"A\n", QMargins(), 9, "no margins"},
        {"A\n", QMargins(2540, 5080, 100, 100), 24, "wide margins, large letters"},
        {"first second\nthird\n\n  fourth\n", QMargins(1270, 1270, 1270, 1270), 10, "lines, blanks, an empty line"},
        {QByteArray("word and another ").repeated(40) + "\n", QMargins(1270, 1270, 1270, 1270), 5, "broken at blanks"},
        {QByteArray("a bcd efghij klmnopqrs ").repeated(40) + "\n", QMargins(1000, 1270, 3210, 1270), 4,
         "broken at other blanks"},
    };
    // What the library itself says about characters is understood all the same.
    constexpr const char *remark = "Syntax Warning: Invalid 'begincidrange' operator in ToUnicode CMap\n";
    for (const Row &row : rows) {
        PdfOptions options = pdfOptions();
        options.page.margins = row.margins;
        options.page.fontSize = row.fontSize;
        options.page.linesPerPage = 20; // there is room for them at the face's own height
        const std::vector<PdfWord> expected = PdfReadBack(libraryPdf(row.text, options), remark).words();
        const std::vector<PdfWord> words = PdfReadBack(pdfBytes(QString::fromUtf8(row.text), options)).words();
        ASSERT_EQ(words.size(), expected.size()) << row.reason;
        ASSERT_FALSE(words.empty()) << row.reason;
        EXPECT_NEAR(words.front().left, row.margins.left() * 72 / 2540.0, 0.01) << row.reason;
        for (std::size_t i = 0; i < words.size(); ++i) {
            EXPECT_EQ(words[i].text, expected[i].text) << row.reason;
            EXPECT_NEAR(words[i].left, expected[i].left, 0.01) << row.reason << words[i].text.toStdString();
            EXPECT_NEAR(words[i].right, expected[i].right, 0.01) << row.reason << words[i].text.toStdString();
            EXPECT_NEAR(words[i].top, expected[i].top, 0.01) << row.reason << words[i].text.toStdString();
            EXPECT_NEAR(words[i].bottom, expected[i].bottom, 0.01) << row.reason << words[i].text.toStdString();
        }
    }
}

TEST(PdfExportPage, TheLinesOfAFullPageAreInItsBox)
{
    struct Row
    {
        unsigned fontSize;
        int linesPerPage;
        const char *reason;
    };
    constexpr Row rows[] = {
        {9, 60, "room enough"},
        {8, 72, "the usual page"},
        {10, 72, "close"},
        {12, 72, "too large for so many"},
        {9, 200, "much too large for so many"},
        {9, 1, "a page of one line"},
    };
    for (const Row &row : rows) {
        PdfOptions options = pdfOptions();
        options.page.fontSize = row.fontSize;
        options.page.linesPerPage = row.linesPerPage;
        QString text;
        for (int line = 1; line <= row.linesPerPage * 2; ++line) {
            text += QStringLiteral("line%1\r\n").arg(line);
        }
        const PdfReadBack pdf(pdfBytes(text, options));
        EXPECT_EQ(pdf.pageCount(), 2) << row.reason;
        for (const int page : {1, 2}) {
            const std::vector<PdfWord> words = pdf.words(page);
            ASSERT_EQ(words.size(), static_cast<std::size_t>(row.linesPerPage)) << row.reason;
            EXPECT_EQ(words.back().text, QStringLiteral("line%1").arg(row.linesPerPage * page)) << row.reason;
            EXPECT_GE(words.front().top, 36) << row.reason;
            EXPECT_LE(words.back().bottom, 841.92 - 36) << row.reason;
            double step = 0;
            for (std::size_t i = 1; i < words.size(); ++i) {
                EXPECT_NEAR(words[i].left, 36, 0.01) << row.reason;
                step = step > 0 ? step : words[1].top - words[0].top;
                EXPECT_NEAR(words[i].top - words[i - 1].top, step, 0.05) << row.reason << ": evenly";
            }
        }
    }
}

TEST(PdfExportPage, TheFacesOfTheTextAreEmbedded)
{
    const QString gothic = QStringLiteral("MSGOTHIC.TTC");
    const QString lucida = QStringLiteral("lucon.TTF");
    FontFolder both;
    both.with(gothic, zenHeiFile()).with(lucida, dejaVuFile());
    FontFolder lucidaOnly;
    lucidaOnly.with(lucida, dejaVuFile());
    struct Row
    {
        QStringList folders;
        QStringView text;
        QStringList expected; ///< names between the tag of a subset and the style
        const char *reason;
    };
    const QString dejaVu = QStringLiteral("DejaVuSansMono");
    const QString zenHei = QStringLiteral("WenQuanYiZenHei");
    const QString zenHeiMono = QStringLiteral("WenQuanYiZenHeiMono");
    const Row rows[] = {
        {{}, u"A é ∞", {dejaVu}, "no preferred face: the first that has all"},
        {{}, u"測量 é ∞", {dejaVu, zenHeiMono}, "and what it lacks from another"},
        {{}, u"測量測量測量測量測量 1", {dejaVu, zenHeiMono}, "however much that is"},
        {{}, u"e\u0301 x\u0304", {dejaVu}, "marks"},
        {{}, u"\uFFFD", {dejaVu}, "the sign for what no face has"},
        {{both.path()}, u"A", {zenHei}, "the Gothic face even for pure ASCII"},
        {{lucidaOnly.path()}, u"A", {dejaVu}, "the other one"},
        {{lucidaOnly.path(), both.path()}, u"A", {zenHei}, "the Gothic face wherever it is"},
        {{lucidaOnly.path()}, u"A 測", {dejaVu, zenHeiMono}, "the other one, and what it lacks"},
    };
    for (const Row &row : rows) {
        PdfOptions options = pdfOptions();
        options.fontFolders = row.folders;
        const PdfReadBack pdf(pdfBytes(row.text, options));
        EXPECT_EQ(pdf.pages(), QStringList{row.text.toString()}) << row.reason;
        QStringList names;
        for (const PdfFont &font : pdf.fonts()) {
            names.append(font.name.section(u'+', 1).section(u',', 0, 0));
            EXPECT_EQ(font.type, QStringLiteral("CID TrueType")) << row.reason;
            EXPECT_TRUE(font.isEmbedded) << row.reason;
            EXPECT_TRUE(font.isSubset) << row.reason;
            EXPECT_TRUE(font.hasTextMap) << row.reason;
        }
        names.sort();
        QStringList expected = row.expected;
        expected.sort();
        EXPECT_EQ(names, expected) << row.reason;
    }
}

} // namespace

#include "PdfFixture.h"

#include <gtest/gtest.h>

#include <QRegularExpression>

// What a PDF says about its fonts.

namespace
{

int count(const QByteArray &text, const char *pattern)
{
    const QRegularExpression expression(QString::fromLatin1(pattern), QRegularExpression::DotMatchesEverythingOption);
    auto matches = expression.globalMatch(QString::fromLatin1(text));
    int found = 0;
    while (matches.hasNext()) {
        matches.next();
        ++found;
    }
    return found;
}

TEST(PdfFont, TextMapsNameTheCharactersThatAreShown)
{
    const QByteArray objects = PdfReadBack(pdfBytes(u"ABC xyz\u00E9 \u6E2C\u6E2D\r\n", pdfOptions())).objects();
    EXPECT_FALSE(objects.contains("cidrange")) << "readers know no such operator in a text map";
    for (const char *range : {"<0020> <0020> <0020>\n", "<0041> <0043> <0041>\n", "<0078> <007a> <0078>\n",
                              "<00e9> <00e9> <00e9>\n", "<6e2c> <6e2d> <6e2c>\n"})
    {
        EXPECT_EQ(objects.count(range), 1) << range;
    }
    EXPECT_EQ(objects.count("beginbfrange"), 2) << "one for each face";
    EXPECT_TRUE(objects.contains("4 beginbfrange")) << "of what the first shows";
    EXPECT_TRUE(objects.contains("1 beginbfrange")) << "of what the other shows";
}

TEST(PdfFont, ATextMapHasShortBlocksAndRangesOfOneHighByte)
{
    QString every;
    for (char16_t character = 0x100; character < 0x300; character = static_cast<char16_t>(character + 2)) {
        every += QChar(character);
    }
    const QByteArray sparse = PdfReadBack(pdfBytes(every, pdfOptions())).objects();
    EXPECT_GT(sparse.count(" beginbfrange"), 2);
    EXPECT_EQ(count(sparse, "\\b(?!100 )\\d{3,} beginbfrange"), 0) << "blocks have 100 entries at most";
    const QByteArray across = PdfReadBack(pdfBytes(u"\u00FE\u00FF\u0100\u0101", pdfOptions())).objects();
    EXPECT_TRUE(across.contains("<00fe> <00ff> <00fe>\n<0100> <0101> <0100>\n"));
}

TEST(PdfFont, WidthsAreThoseOfTheCharactersThatAreShown)
{
    const QByteArray bytes = pdfBytes(QStringLiteral("A\u00E9 測量\r\n"));
    const QByteArray objects = PdfReadBack(bytes).objects();
    EXPECT_TRUE(objects.contains("/DW 602")) << "all of the fixed-pitch face";
    EXPECT_TRUE(objects.contains("/DW 1000")) << "and of CJK";
    EXPECT_EQ(count(objects, "/W \\[\\s*\\]"), 2) << "no other width";
    const QByteArray mixed = PdfReadBack(pdfBytes(QStringLiteral("測量 ℃\r\n"))).objects();
    EXPECT_EQ(count(mixed, "/W \\[\\s*8451\\s*\\[\\s*921\\s*\\]\\s*\\]"), 1) << "a sign of another width";
}

TEST(PdfFont, ACollectionsFaceAddsLittleToTheFile)
{
    const qsizetype plain = pdfBytes(QStringLiteral("A\r\n")).size();
    const qsizetype cjk = pdfBytes(QStringLiteral("A 測\r\n")).size();
    EXPECT_LT(cjk - plain, 300'000) << "the tables of the face, but no list of all widths";
}

} // namespace

#include "RichTextImage.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

namespace
{

using kareport::RichTextImage;
using Form = RichTextImage::Form;

/// The document around the pieces, in the report's usual font.
QString documentOf(const QString &pieces)
{
    return QStringLiteral("{\\rtf1\\ansi\\ansicpg1252\\deff0\\deflang1033{\\fonttbl{\\f9\\fnil\\fcharset0 Lucida "
                          "Console;}}") +
           pieces + u'}';
}

QString richDocument(const RichTextImage &image)
{
    return image.document(QStringLiteral("Lucida Console"), 9, Form::RichText);
}

TEST(RichTextImage, EveryPieceIsInTheTemplateOfItsStyle)
{
    struct Row
    {
        QStringView text;
        int style;
        QStringView expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"ABC", 0, u"\\viewkind4\\uc1\\pard\\f1\\fs18 ABC ", "plain, with the blank of the template"},
        {u"ABC", 1, u"\\viewkind4\\uc1\\pard\\b\\f1\\fs18 ABC\\b0 ", "bold"},
        {u"ABC", 2, u"\\viewkind4\\uc1\\pard\\ul\\f1\\fs18 ABC\\ulnone ", "underlined"},
        {u"ABC", 3, u"\\viewkind4\\uc1\\pard\\ul\\b\\f1\\fs18 ABC\\ulnone\\b0 ", "both"},
        {u"ABC", 4, u"", "no such style"},
        {u"ABC", -1, u"", "no such style"},
        {u"ABC", 1000000, u"", "no such style"},
        {u"", 0, u"\\par", "a line end"},
        {u"", 3, u"\\par", "a line end has no style"},
        {u"", 4, u"\\par", "a line end has no style"},
        {u" ", 0, u"\\viewkind4\\uc1\\pard\\f1\\fs18   ", "a blank is text"},
        {u"a{b}\\c", 0, u"\\viewkind4\\uc1\\pard\\f1\\fs18 a{b}\\c ", "markup goes in as it is"},
        {u"é測\xD83D\xDE00", 1, u"\\viewkind4\\uc1\\pard\\b\\f1\\fs18 é測\xD83D\xDE00\\b0 ", "nothing is escaped"},
        {u"<<RTF Data>>", 0, u"\\viewkind4\\uc1\\pard\\f1\\fs18 <<RTF Data>> ",
         "a text that is the templates' own key"},
        {u"a\r\nb", 0, u"\\viewkind4\\uc1\\pard\\f1\\fs18 a\r\nb ", "line ends of the text stay what they are"},
        {u"%1\\n", 2, u"\\viewkind4\\uc1\\pard\\ul\\f1\\fs18 %1\\n\\ulnone ", "a percent sign is text"},
    };
    for (const Row &row : rows) {
        RichTextImage image;
        image.setOn(true);
        image.write(row.text, row.style, Form::RichText);
        EXPECT_EQ(richDocument(image), documentOf(row.expected.toString())) << row.reason;
    }
}

TEST(RichTextImage, PiecesFollowEachOtherWithNothingBetween)
{
    RichTextImage image;
    image.setOn(true);
    image.write(u"ABC", 0, Form::RichText);
    image.write({}, 0, Form::RichText);
    image.write(u"X", 1, Form::RichText);
    image.write({}, 0, Form::RichText);
    const QString expected = documentOf(
        QStringLiteral("\\viewkind4\\uc1\\pard\\f1\\fs18 ABC \\par\\viewkind4\\uc1\\pard\\b\\f1\\fs18 X\\b0 \\par"));
    EXPECT_EQ(richDocument(image), expected);
    EXPECT_EQ(richDocument(image), expected) << "reading it changes nothing";
}

TEST(RichTextImage, IsEmptyAsLongAsItIsOff)
{
    RichTextImage image;
    EXPECT_FALSE(image.isOn());
    image.write(u"ABC", 0, Form::RichText);
    image.write({}, 0, Form::RichText);
    image.write(u"ABC", 0, Form::BareText);
    EXPECT_EQ(richDocument(image), documentOf(QString()));
    EXPECT_EQ(image.document(QString(), 9, Form::BareText), QString());
}

TEST(RichTextImage, SwitchingKeepsWhatWasWritten)
{
    const QString piece = QStringLiteral("\\viewkind4\\uc1\\pard\\f1\\fs18 %1 ");
    RichTextImage image;
    image.setOn(true);
    EXPECT_TRUE(image.isOn());
    image.write(u"one", 0, Form::RichText);
    image.setOn(false);
    EXPECT_FALSE(image.isOn());
    image.write(u"not heard", 0, Form::RichText);
    EXPECT_EQ(richDocument(image), documentOf(piece.arg(u"one"))) << "off again";
    image.setOn(true);
    image.setOn(true);
    image.write(u"two", 0, Form::RichText);
    EXPECT_EQ(richDocument(image), documentOf(piece.arg(u"one") + piece.arg(u"two"))) << "on again";
    image.clear();
    EXPECT_EQ(richDocument(image), documentOf(QString()));
    EXPECT_TRUE(image.isOn()) << "clearing does not switch";
    image.write(u"three", 0, Form::RichText);
    EXPECT_EQ(richDocument(image), documentOf(piece.arg(u"three"))) << "the templates outlive clearing";
}

TEST(RichTextImage, BareTextIsOnlyWhatWasWritten)
{
    RichTextImage image;
    image.setOn(true);
    image.write(u"a\tb", 0, Form::BareText);
    image.write({}, 0, Form::BareText);
    image.write(u"{c}\\", 7, Form::BareText);
    image.write(u"測", 3, Form::BareText);
    EXPECT_EQ(image.document(QStringLiteral("Lucida Console"), 9, Form::BareText), QStringLiteral("a\tb{c}\\測"))
        << "no head, no paragraph marks, no styles";
    EXPECT_EQ(richDocument(image), documentOf(QStringLiteral("a\tb{c}\\測"))) << "the head belongs to the reading";
}

TEST(RichTextImage, TheFontTablesNumberIsTheFontSize)
{
    struct Row
    {
        QStringView name;
        unsigned size;
        QStringView expected;
    };
    constexpr Row rows[] = {
        {u"Lucida Console", 9, u"{\\fonttbl{\\f9\\fnil\\fcharset0 Lucida Console;}}"},
        {u"Courier New", 12, u"{\\fonttbl{\\f12\\fnil\\fcharset0 Courier New;}}"},
        {u"", 0, u"{\\fonttbl{\\f0\\fnil\\fcharset0 ;}}"},
        {u"ＭＳ ゴシック", 4294967295U, u"{\\fonttbl{\\f4294967295\\fnil\\fcharset0 ＭＳ ゴシック;}}"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(RichTextImage::fontTable(row.name.toString(), row.size), row.expected.toString());
    }
}

TEST(RichTextImage, ADocumentIsCutToItsParagraph)
{
    struct Row
    {
        QStringView document;
        bool isCut;
        QStringView expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"{\\rtf1{\\fonttbl}\\viewkind4 a }", true, u"\\viewkind4 a ", "up to the brace that closes it"},
        {u"x\\viewkind}", true, u"\\viewkind", "the shortest"},
        {u"x\\viewkind4 {a} b}", true, u"\\viewkind4 {a", "the first closing brace, whatever it closes"},
        {u"x\\viewkind1}\\viewkind2}", true, u"\\viewkind1", "the first paragraph"},
        {u"}x\\viewkind4}", true, u"\\viewkind4", "a brace before it does not count"},
        {u"\\viewkind4 a}", false, u"\\viewkind4 a}", "at the very start"},
        {u"\\viewkind4 a}x\\viewkind5 b}", false, u"\\viewkind4 a}x\\viewkind5 b}", "only the first one is looked at"},
        {u"{\\rtf1\\viewkind4 a", false, u"{\\rtf1\\viewkind4 a", "no closing brace"},
        {u"{\\rtf1}\\viewkind4 a", false, u"{\\rtf1}\\viewkind4 a", "a closing brace only before it"},
        {u"{\\rtf1\\VIEWKIND4 a}", false, u"{\\rtf1\\VIEWKIND4 a}", "in other letters"},
        {u"{\\rtf1\\viewkin", false, u"{\\rtf1\\viewkin", "cut off"},
        {u"", false, u"", "empty"},
    };
    for (const Row &row : rows) {
        QString document = row.document.toString();
        EXPECT_EQ(RichTextImage::cutToParagraph(document), row.isCut) << row.reason;
        EXPECT_EQ(document, row.expected.toString()) << row.reason;
    }
}

} // namespace

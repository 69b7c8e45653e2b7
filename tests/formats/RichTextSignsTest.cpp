#include "RichTextSigns.h"
#include "RichTextReader.h"

#include "PrintQt.h"

#include <QTextDocument>

#include <gtest/gtest.h>

namespace
{

using kareport::readRichTextCharacters;

constexpr char fonts[] =
    "{\\rtf1\\deff0{\\fonttbl{\\f0\\fcharset0 Arial;}{\\f1\\fcharset2 Symbol;}{\\f2\\fcharset2 Wingdings;}"
    "{\\f3\\fcharset2 Webdings;}{\\f4\\ftech SYMBOL;}{\\f5\\fcharset0 Symbol;}{\\f6\\fcharset2 Wingdings 2;}}";

TEST(RichTextSigns, SignsOfKnownFontsBecomeCharacters)
{
    struct Row
    {
        QByteArray bytes;
        QStringView expected;
        int unknown;
        const char *reason;
    };
    const Row rows[] = {
        {"\\f1 abc", u"αβχ", 0, "letters of the font Symbol are Greek"},
        {"\\f1 D = 5\\'b0 - \\{x\\}", u"Δ = 5° − {ξ}", 0,
         "digits, blanks and braces are themselves, the hyphen is a minus"},
        {"\\f1\\'b7\\u-3913?\\u61623?", u"•••", 0, "a bullet by its byte and as a private character, signed or not"},
        {"\\u-3913?\\u61623?", u"••", 0, "a bullet in a font of letters, where lists of old files have it"},
        {"\\f1\\u-3929?\\u945?a", u"♣αα", 0, "what is given in Unicode stays"},
        {"\\f1 a\\tab b\\line c\\~", u"α\tβ\u2028χ\u00A0", 0, "what has a word of its own is in no font"},
        {"\\f1{\\f0 a}a\\plain a", u"aαa", 0, "the font ends with its group, and with \\plain"},
        {"\\f2\\'fc\\'a7 n", u"✔▪ ■", 0, "marks of lists in the font Wingdings"},
        {"\\f2\\u-3844?\\u61607?", u"✔▪", 0, "as private characters"},
        {"\\f2\\'b7\\u-3913?", u"🕐🕐", 0, "no bullet in this font, but a clock, which is two halves"},
        {"\\f2 !\\'f5\\'f6\\'f7\\'f8", u"🖉⬁⬀⬃⬂", 0, "from the first sign to the last arrows"},
        {"\\f2\\'ff\\'7f", u"\xF0FF\xF07F", 2, "what the font has no character for"},
        {"\\f1\\'f0\\'80", u"\xF0F0\xF080", 2, "what the font has no character for"},
        {"\\f3 a b\\'fc\\u-3844?\\'b7", u"a b\xF0FC\xF0FC•", 4,
         "a font that is not known: letters stay, blanks are not signs"},
        {"\\f2\\'21\\'4a\\'20", u"🖉☺ ", 0, "letters by their bytes"},
        {"\\f6\\'52", u"R", 1, "a name that only begins as a known one"},
        {"\\f4 a\\'b7", u"α•", 0, "without a character set, by the name in any case"},
        {"\\f5 a\\'b7\\u-3929?", u"a·♣", 0, "with one of letters, bytes are letters"},
        {"\\u-3929?\\u-4064?\\u-4096?", u"\xF0A7\xF020\xF000", 3, "in a font of letters there is no telling"},
        {"\\f1\\u57344?\\u61696?", u"\xE000\xF100", 0, "other private characters are not signs"},
    };
    for (const Row &row : rows) {
        const QByteArray bytes = fonts + row.bytes + '}';
        QString text;
        kareport::RichTextNotes notes;
        EXPECT_FALSE(readRichTextCharacters(bytes, text, &notes)) << row.reason;
        EXPECT_EQ(text, row.expected) << row.reason;
        EXPECT_EQ(notes.signs, row.unknown) << row.reason;
        QTextDocument document;
        EXPECT_FALSE(kareport::readRichText(QByteArrayView(bytes), document, &notes)) << row.reason;
        EXPECT_EQ(document.toRawText(), row.expected) << row.reason;
        EXPECT_EQ(notes.signs, row.unknown) << row.reason;
    }
}

TEST(RichTextSigns, ATextWithoutAFontIsNotReadAsSigns)
{
    QString text;
    EXPECT_FALSE(readRichTextCharacters("{\\rtf1{\\fonttbl{\\f3\\fcharset2 Symbol;}{\\f4 Arial;}}abc\\f7 d}", text));
    EXPECT_EQ(text, QStringLiteral("abcd")) << "the default font is not in the table, nor is the other";
    EXPECT_FALSE(readRichTextCharacters("{\\rtf1{\\fonttbl{\\f3\\fcharset2 Symbol;}}abc\\f3 d}", text));
    EXPECT_EQ(text, QStringLiteral("abcδ")) << "a table of signs alone";
}

TEST(RichTextSigns, EverySignIsACharacterThatUnicodeHas)
{
    for (const QStringView family : {u"Symbol", u"Wingdings"}) {
        const kareport::RichTextSigns *signs = kareport::signsOfFont(family);
        ASSERT_NE(signs, nullptr);
        int known = 0;
        for (const char32_t sign : *signs) {
            known += sign != 0 ? 1 : 0;
            EXPECT_NE(QChar::category(sign), QChar::Other_PrivateUse) << std::hex << std::uint32_t(sign);
            EXPECT_TRUE(QChar::category(sign) != QChar::Other_NotAssigned) << std::hex << std::uint32_t(sign);
            EXPECT_FALSE(QChar::isSurrogate(sign)) << std::hex << std::uint32_t(sign);
        }
        EXPECT_EQ(known, family == u"Symbol" ? 189 : 222);
    }
}

} // namespace

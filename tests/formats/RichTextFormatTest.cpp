#include "RichTextDescription.h"

using richtext::expectBodies;
using richtext::Row;
using richtext::shown;

namespace
{

TEST(RichTextFormat, ReadsFormatsOfCharacters)
{
    const Row rows[] = {
        {"a\\b b\\b0 c", u"a<b>b<>c", "bold"},
        {"{\\i a}b", u"<i>a<>b", "italic, to the end of its group"},
        {"\\b\\i a\\plain b", u"<b i>a<>b", "as if nothing had been said"},
        {"\\b1 a\\b99 b", u"<b>ab", "any number but 0 is on"},
        {"\\strike a\\strike0 b\\striked1 c\\striked0 d", u"<s>a<>b<s>c<>d", "struck out once and twice"},
        {"\\ul a\\ulnone b\\uld c\\ul0 d", u"<u>a<>b<u3>c<>d", "underlined"},
        {"\\uldb a\\ulth b\\ulw c", u"<u>abc", "doubled, thick, words: a line"},
        {"\\uldash a\\ulldash b\\ulthdash c\\ulthldash d", u"<u2>abcd", "dashes"},
        {"\\uldashd a\\ulthdashd b\\uldashdd c\\ulthdashdd d", u"<u4>ab<u5>cd", "dashes and dots"},
        {"\\ulwave a\\ulhwave b\\ululdbwave c\\ulthd d", u"<u6>abc<u3>d", "waves; thick dots"},
        {"\\super a\\nosupersub b\\sub c\\super0 d", u"<super>a<>b<sub>c<>d", "above and below the line"},
        {"\\up6 a\\up0 b\\dn6 c", u"<super>a<>b<sub>c", "by a distance"},
        {"\\caps a\\caps0\\scaps b", u"<caps>a<scaps>b", "capitals"},
        {"\\fs18 a\\fs19 b\\fs c", u"<9pt>a<9.5pt>b<>c", "half points; without a number the usual size"},
        {"\\fs0 a\\fs-5 b\\fs99999999999 c", u"ab<1638pt>c", "sizes that are not valid"},
    };
    expectBodies(rows);
}

TEST(RichTextFormat, ReadsColours)
{
    const QByteArray table =
        "{\\colortbl;\\red255\\green0\\blue0;\\red0\\green128\\blue255;\\red255\\green255\\blue255;}";
    const Row rows[] = {
        {"\\cf1 a\\cf2 b\\cf0 c", u"<#ff0000>a<#0080ff>b<>c", "colours of the text; 0 is the reader's own"},
        {"\\cf3 a", u"<#ffffff>a", "white is a colour"},
        {"\\cf4 a\\cf-1 b\\cf99999999999 c", u"abc", "not in the table"},
        {"\\cb1 a\\cb0 b\\chcbpat2 c\\chcbpat0 d", u"<on #ff0000>a<>b<on #0080ff>c<>d", "behind the text"},
        {"\\highlight1 a\\highlight0 b", u"<on #ff0000>a<>b", "marked"},
        {"\\pard\\cbpat1 a\\par\\pard b", u"[on #ff0000]a|b", "behind the paragraph"},
    };
    expectBodies(rows, table);
    const Row tables[] = {
        {"{\\colortbl\\red1\\green2\\blue3;;}\\cf0 a\\cf1 b", u"<#010203>a<>b", "without one of the reader's own"},
        {"{\\colortbl;\\red999\\green-1;}\\cf1 a", u"<#ff0000>a", "out of range, not complete"},
        {"{\\colortbl}\\cf1 a", u"a", "an empty table"},
        {"\\cf1 a", u"a", "no table"},
    };
    expectBodies(tables);
}

TEST(RichTextFormat, ReadsFonts)
{
    const Row rows[] = {
        {"{\\fonttbl{\\f0\\froman Times;}{\\f1\\fswiss\\fprq2{\\*\\panose 01}Arial{\\*\\falt Helv};}}a\\f1 b",
         u"<Times kind1>a<Arial kind0>b", "a group for each font"},
        {"{\\fonttbl\\f0\\fnil One;\\f5\\fmodern Two;}\\f5 a\\f0 b", u"<Two kind7>a<One>b", "without groups"},
        {"\\deff1{\\fonttbl{\\f0 One;}{\\f1 Two;}}a{\\f0 b\\plain c}", u"<Two>a<One>b<Two>c", "the default font"},
        {"{\\fonttbl{\\f0 One;}{\\f1 Two;}}\\f1 a\\f7 b", u"<Two>a<One>b", "a font that is not in the table"},
        {"{\\fonttbl{\\f3 One}}\\f3 a", u"<One>a", "a name without its end"},
        {"{\\fonttbl{\\f0;}{\\f1 ;}}\\f1 a", u"a", "fonts without a name"},
        {"{\\fonttbl}\\f1 a", u"a", "an empty table"},
        {"{\\fonttbl{\\f0 One;}{\\f0 Two;}}\\f0 a", u"<Two>a", "a number twice: the last one"},
        {"{\\fonttbl{\\f0\\fcharset128 \\'82\\'6c\\'82\\'72;}}a", u"<ＭＳ>a", "a name in its own character set"},
        {"{\\fonttbl{\\f0 \\u65325?\\u65331?;}}a", u"<ＭＳ>a", "a name in Unicode"},
    };
    expectBodies(rows);
}

TEST(RichTextFormat, ReadsFormatsOfParagraphs)
{
    const Row rows[] = {
        {"\\qr a\\par\\qc b\\par\\qj c\\par\\ql d\\par\\qd e", u"[right]a|[centre]b|[justify]c|d|[justify]e",
         "aligned"},
        {"\\qr a\\par b\\par\\pard c\\par", u"[right]a|[right]b|c", "until something else is said"},
        {"a\\qr b\\par", u"[right]ab", "what is in force at the end of the paragraph holds"},
        {"{\\qr a\\par}b\\par", u"[right]a|b", "to the end of its group"},
        {"{\\qr a}\\par", u"a", "at its end something else is in force"},
        {"\\qc a", u"[centre]a", "at the end of the file"},
        {"\\li360\\ri720\\fi-180\\sb150\\sa300 a", u"[l24 r48 f-12 t10 b20]a",
         "indents and distances, 15 twips a pixel"},
        {"\\sl360\\slmult1 a\\par\\sl300\\slmult0 b\\par\\sl-300 c\\par\\sl0 d", u"[h1:150]a|[h3:20]b|[h2:20]c|d",
         "line spacing: times, at least, exactly"},
        {"\\tx1500\\tqr\\tx3000\\tqc\\tx4500\\tqdec\\tx6000\\tx7500 a",
         u"[tab0:100 tab1:200 tab2:300 tab3:400 tab0:500]a", "tab stops"},
        {"\\li300\\fi-150\\tx1500 a", u"[l20 f-10 tab0:90]a", "tab stops count from the margin of the page"},
        {"\\pagebb a\\par\\pagebb0 b", u"[page]a|b", "on a page of its own"},
        {"\\rtlpar a\\par\\ltrpar b", u"[rtl]a|b", "from right to left"},
        {"\\li99999999999 a\\par\\li-99999999999 b", u"[l2112]a|[l-2112]b", "no further than a page can be"},
        {"\\qr\\par\\pard\\par x", u"[right]||x", "empty paragraphs have formats"},
    };
    expectBodies(rows);
}

TEST(RichTextFormat, BreaksPages)
{
    const Row rows[] = {
        {"a\\par\\page b\\par c", u"a|[page]b|c", "before the next paragraph, and only that one"},
        {"a\\page b", u"a|[page]b", "in the middle of a paragraph"},
        {"{\\page}a", u"[page]a", "at the beginning"},
        {"a\\par\\page", u"a", "at the end there is no next one"},
        {"a\\sect\\sectd b", u"a|[page]b", "a section begins on a page of its own"},
        {"a\\sect\\sectd\\sbknone b", u"a|b", "unless it says otherwise"},
        {"\\sectd\\sbknone a\\page b", u"a|[page]b", "said of the section before"},
        {"a\\page\\sect\\sbknone b", u"a|[page]b", "a page end stays one"},
        {"a\\page\\page b", u"a|[page]b", "twice in the same place is once"},
    };
    expectBodies(rows);
}

TEST(RichTextFormat, ManyFormatsAreKeptApart)
{
    // To a document all fonts look alike and all tab stops, until they are compared one by one.
    constexpr int count = 6000;
    QByteArray fonts("{\\rtf1{\\fonttbl");
    QByteArray text;
    QByteArray tabs("{\\rtf1");
    for (int i = 0; i < count; ++i) {
        const QByteArray number = QByteArray::number(i);
        fonts += "{\\f" + number + " F" + number + ";}";
        text += "\\f" + number + " x";
        // Tab stops are limited to the width of a page.
        tabs +=
            "\\pard\\tx" + QByteArray::number(i % 300) + "\\tx" + QByteArray::number(300 + 15 * (i / 300)) + " x\\par";
    }
    EXPECT_TRUE(shown(fonts + "}" + text + "}").endsWith(QStringLiteral("<F5999>x")));
    EXPECT_TRUE(shown(tabs + "}").endsWith(QStringLiteral("[tab0:19.9333 tab0:39]x")));
}

} // namespace

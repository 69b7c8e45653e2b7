#include "TagScanner.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

#include <string>

using kareport::ExtractNode;
using kareport::GetNode;
using kareport::NodeSequence;
using kareport::ScanElement;
using kareport::ScanNote;
using kareport::ScanNotes;
using kareport::ScanText;

namespace
{

struct Row
{
    const char16_t *text;
    const char16_t *tag;
    qsizetype open; ///< -1: no element
    const char16_t *value;
    const char16_t *left; ///< after removal
    const char *reason;
};

constexpr Row rows[] = {
    {u"", u"NAME", -1, u"", u"", "nothing to search"},
    {u"Stakeout", u"NAME", -1, u"", u"Stakeout", "no tag at all"},
    {u"<Name>Stakeout</Name>", u"NAME", 0, u"Stakeout", u"", "the plain element"},
    {u"ab<Name>Stakeout</Name>cd", u"NAME", 2, u"Stakeout", u"abcd", "what surrounds it closes up"},
    {u"<name>x</name>", u"NAME", 0, u"x", u"", "the tag in lower case"},
    {u"<NAME>x</NAME>", u"NAME", 0, u"x", u"", "the tag in upper case"},
    {u"<nAmE>x</NaMe>", u"NAME", 0, u"x", u"", "both tags in mixed case"},
    {u"<Name> aB </Name>", u"NAME", 0, u" aB ", u"", "the value keeps its case and its blanks"},
    {u"<Name>a &amp; b</Name>", u"NAME", 0, u"a &amp; b", u"", "no entity is decoded"},
    {u"<Name><![CDATA[x]]></Name>", u"NAME", 0, u"<![CDATA[x]]>", u"", "no CDATA is taken off"},
    {u"<Name></Name>x", u"NAME", 0, u"", u"x", "an empty element is there and can be cut out"},
    {u"<Name>a</Name><Name>b</Name>", u"NAME", 0, u"a", u"<Name>b</Name>", "the first of two"},
    {u"<Name >x</Name>", u"NAME", -1, u"", u"<Name >x</Name>", "a blank in the opening tag makes it no tag"},
    {u"< Name>x</Name>", u"NAME", -1, u"", u"< Name>x</Name>", "a blank in front of the name makes it no tag"},
    {u"<Name a=\"1\">x</Name>", u"NAME", -1, u"", u"<Name a=\"1\">x</Name>", "an attribute makes it no tag"},
    {u"<Name/>", u"NAME", -1, u"", u"<Name/>", "a self-closing tag is not read"},
    {u"<Name>x</Name >", u"NAME", -1, u"", u"<Name>x</Name >", "a blank in the closing tag makes it no tag"},
    {u"<Name>x</ Name>", u"NAME", -1, u"", u"<Name>x</ Name>", "a blank after the slash makes it no tag"},
    {u"<Names>x</Names>", u"NAME", -1, u"", u"<Names>x</Names>", "a longer name is another element"},
    {u"<VariableName>x</VariableName>", u"NAME", -1, u"", u"<VariableName>x</VariableName>",
     "a name that ends with the searched one is another element"},
    {u"<Nam>x</Nam>", u"NAME", -1, u"", u"<Nam>x</Nam>", "a shorter name is another element"},
    {u"<Name>x", u"NAME", -1, u"", u"<Name>x", "no closing tag"},
    {u"x</Name>", u"NAME", -1, u"", u"x</Name>", "no opening tag"},
    {u"<Name", u"NAME", -1, u"", u"<Name", "cut off in the opening tag"},
    {u"<Name>x</Nam", u"NAME", -1, u"", u"<Name>x</Nam", "cut off in the closing tag"},
    {u"<Name>x</", u"NAME", -1, u"", u"<Name>x</", "cut off in the short closing tag"},
    {u"</Name><Name>x</Name>", u"NAME", -1, u"", u"</Name><Name>x</Name>",
     "the first closing tag of the whole text counts, and it is before the opening tag"},
    {u"</Name><Name>x</>", u"NAME", -1, u"", u"</Name><Name>x</>",
     "a full closing tag anywhere rules the short one out"},
    {u"<Name>a<Name>b</Name>c</Name>", u"NAME", 0, u"a<Name>b", u"c</Name>", "nested: the first closing tag ends it"},
    {u"<Name>x</>", u"NAME", 0, u"x", u"", "the short closing tag, at the end of the text"},
    {u"<Name>x</>1234567", u"NAME", 0, u"x", u"567", "4 characters go with a short closing tag"},
    {u"<Name>x</>123", u"NAME", 0, u"x", u"", "fewer than 4 characters are left to go with it"},
    {u"<Name>x</>1234", u"NAME", 0, u"x", u"", "exactly 4 characters are left to go with it"},
    {u"<Name>x</><Title>y</Title>", u"NAME", 0, u"x", u"le>y</Title>", "what is dropped can be a tag's begin"},
    {u"</><Name>x</>", u"NAME", 3, u"x", u"</>", "a short closing tag before the opening tag is skipped"},
    {u"<Name></>1234x", u"NAME", 0, u"", u"x", "an empty element with the short closing tag"},
    {u"<Name>x</>y</Name>z", u"NAME", 0, u"x</>y", u"z",
     "a full closing tag further on wins over a short one before it"},
    {u"<Name>a<Title>b</></Name>", u"TITLE", 7, u"b", u"<Name>ae>",
     "the dropped characters are counted, not looked at"},
    {u"<<Name>x</Name>", u"NAME", 1, u"x", u"<", "a tag directly after another \"<\""},
    {u"<Name>x<</Name>", u"NAME", 0, u"x<", u"", "a value that ends with \"<\""},
    {u"<Na<Name>me>x</Name>", u"NAME", 3, u"me>x", u"<Na", "a tag inside a torn tag"},
    {u"<TıTLE>x</TıTLE>", u"TITLE", 0, u"x", u"", "the dotless i is an I in capitals"},
    {u"<Uſe>x</uſE>", u"USE", 0, u"x", u"", "the long s is an S in capitals"},
    {u"<Tİtle>x</Title>", u"TITLE", -1, u"", u"<Tİtle>x</Title>", "a capital I with a dot is not one without"},
    {u"ßßß<Name>ß</Name>ß", u"NAME", 3, u"ß", u"ßßßß", "a sharp s stays one character in capitals"},
    {u"ŉǰΐ<Name>x</Name>", u"NAME", 3, u"x", u"ŉǰΐ", "no character grows in capitals and moves the positions"},
    {u"\U0001F600<Name>\U0001F600</Name>", u"NAME", 2, u"\U0001F600", u"\U0001F600",
     "positions count 16-bit characters"},
    {u"<Name>x</>\U0001F600\U0001F600z", u"NAME", 0, u"x", u"z", "dropped characters are 16-bit characters"},
    {u"<Name>点</Name>", u"NAME", 0, u"点", u"", "a value in CJK"},
    {u"<ID>1</>ab2", u"ID", 0, u"1", u"2", "as many characters go as the name is long"},
};

std::string shown(const Row &row)
{
    return std::string(row.reason) + ": " + QString::fromUtf16(row.text).toStdString();
}

TEST(TagScanner, CutsTheFirstElementOfAName)
{
    for (const Row &row : rows) {
        ScanText text(QString::fromUtf16(row.text));
        const ScanElement element = ExtractNode(text, row.tag, true);
        EXPECT_EQ(element.exists(), row.open >= 0) << shown(row);
        EXPECT_EQ(element.source, row.open) << shown(row);
        EXPECT_EQ(element.value.text(), QString::fromUtf16(row.value)) << shown(row);
        EXPECT_EQ(text.text(), QString::fromUtf16(row.left)) << shown(row);
    }
}

TEST(TagScanner, LeavesTheTextAloneWithoutRemoval)
{
    for (const Row &row : rows) {
        ScanText text(QString::fromUtf16(row.text));
        const ScanElement extracted = ExtractNode(text, row.tag, false);
        const ScanElement got = GetNode(text, row.tag);
        EXPECT_EQ(text.text(), QString::fromUtf16(row.text)) << shown(row);
        EXPECT_EQ(extracted.source, row.open) << shown(row);
        EXPECT_EQ(extracted.value.text(), QString::fromUtf16(row.value)) << shown(row);
        EXPECT_EQ(got.source, row.open) << shown(row);
        EXPECT_EQ(got.value.text(), QString::fromUtf16(row.value)) << shown(row);
    }
}

TEST(TagScanner, SequenceBeginsWithWhatTheFirstCutFinds)
{
    for (const Row &row : rows) {
        const ScanText text(QString::fromUtf16(row.text));
        const auto element = NodeSequence(text, row.tag).next();
        const bool expected = row.open >= 0 && *row.value != 0;
        ASSERT_EQ(element.has_value(), expected) << shown(row);
        if (element) {
            EXPECT_EQ(element->source, row.open) << shown(row);
            EXPECT_EQ(element->value.text(), QString::fromUtf16(row.value)) << shown(row);
        }
    }
}

TEST(TagScanner, NameClosedByTheShortFormIsReadAndTakesFourCharactersWithIt)
{
    ScanText text(QStringLiteral("<Name>Stakeout</>1234<Title>T</Title>"));
    EXPECT_EQ(ExtractNode(text, u"NAME", true).value.text(), QStringLiteral("Stakeout"));
    EXPECT_EQ(text.text(), QStringLiteral("<Title>T</Title>"));
}

struct SequenceRow
{
    const char16_t *text;
    const char16_t *values; ///< with "|" after each
    const char *reason;
};

constexpr SequenceRow sequenceRows[] = {
    {u"", u"", "nothing"},
    {u"<F>a</F>", u"a|", "one"},
    {u"<F>a</F><F>b</F><f>c</f>", u"a|b|c|", "one after the other"},
    {u" <F>a</F> x <F>b</F> ", u"a|b|", "what is between them is skipped"},
    {u"<F>a</F><F></F><F>b</F>", u"a|", "an empty element ends the list"},
    {u"<F></F><F>b</F>", u"", "an empty element at the front ends it at once"},
    {u"<F> </F><F>b</F>", u" |b|", "a blank is not empty"},
    {u"<F>a</F></F><F>b</F>", u"a|", "a closing tag too many is before the next opening tag"},
    {u"</F><F>a</F>", u"", "the same at the front"},
    {u"<F>a<F>b</F>c</F><F>d</F>", u"a<F>b|", "nested: the rest of the outer one is before the next"},
    {u"<F>a</>1<F>b</>2<F>c</>", u"a|b|c|", "short closing tags, each with one character to go"},
    {u"<F>a</><F>b</>", u"a|", "the dropped character was the next tag's begin"},
    {u"<F>a</>1<F>b</F>", u"a</>1<F>b|", "a full closing tag at the end rules the short ones out"},
    {u"<F>a</F><F>b</>1<F>c</>", u"a|b|c|", "after the last full closing tag the short ones count"},
    {u"<F>a</F><F>b", u"a|", "the last one is not closed"},
    {u"<F>a</F><F", u"a|", "cut off in the middle of a tag"},
    {u"<<F>a</F>F>b</F>", u"a|b|", "a cut joins what is left to a new opening tag"},
    {u"<<F>a</F>F></F>", u"a|", "a joined opening tag of an empty element"},
    {u"<<<F>a</F>F>b</F>F>c</F>", u"a|b|c|", "joined again and again"},
    {u"<F<F>a</F>>b</F>", u"a|b|", "joined in the middle of the name's tag"},
    {u"x<<F>a</F>/F><F>b</F>", u"a|", "a cut joins what is left to a closing tag before the next opening tag"},
    {u"<<F>a</F>/F>", u"a|", "a joined closing tag without any opening tag"},
    {u"<<F>a</>1F>b</>2", u"a|b|", "joined where short closing tags are used"},
    {u"<F>a</>1<<F>b</>2/><F>c</>", u"a|b|c|", "a joined short closing tag before the next opening tag is nothing"},
    {u"</<F>a</F>F>b<F>c</F>", u"a|", "joined to a closing tag, its slash kept before the cut"},
};

TEST(TagScanner, SequenceGivesOneElementAfterTheOther)
{
    for (const SequenceRow &row : sequenceRows) {
        const ScanText text(QString::fromUtf16(row.text));
        NodeSequence sequence(text, u"F");
        QString values;
        while (const auto element = sequence.next()) {
            values += element->value.text() + u'|';
        }
        EXPECT_EQ(values, QString::fromUtf16(row.values)) << row.reason;
    }
}

struct NoteRow
{
    const char16_t *text;
    ScanNote::Kind kind;
    qsizetype source; ///< -1: no note
    const char16_t *dropped;
    const char *reason;
};

using Kind = ScanNote::Kind;

constexpr NoteRow noteRows[] = {
    {u"x<F>a</F>", Kind::Unclosed, -1, u"", "nothing to say"},
    {u"", Kind::Unclosed, -1, u"", "no element is not a mistake"},
    {u"a<F>b", Kind::Unclosed, 1, u"", "at the opening tag that is not closed"},
    {u"</F><F>a</F>", Kind::ClosedBeforeOpen, 4, u"", "at the opening tag that is not read"},
    {u"<F>a<F>b</F>", Kind::RunsOn, 4, u"", "at the inner opening tag"},
    {u"<F>a</>x", Kind::ShortCloseDrops, 7, u"x", "at the dropped characters"},
    {u"<F>a</> <F>b</> ", Kind::ShortCloseDrops, -1, u"", "blanks are nothing that is missed"},
};

TEST(TagScanner, NotesWhatWasSkipped)
{
    for (const NoteRow &row : noteRows) {
        const ScanText text(QString::fromUtf16(row.text));
        ScanNotes notes;
        ScanText cut = text;
        ExtractNode(cut, u"F", true, &notes);
        ASSERT_EQ(notes.size(), row.source < 0 ? 0U : 1U) << row.reason;
        ScanNotes sequenceNotes;
        NodeSequence(text, u"F", &sequenceNotes).next();
        ASSERT_EQ(sequenceNotes.size(), notes.size()) << row.reason;
        if (row.source >= 0) {
            for (const ScanNote &note : {notes.front(), sequenceNotes.front()}) {
                EXPECT_EQ(note.kind, row.kind) << row.reason;
                EXPECT_EQ(note.tag, QStringView(u"F")) << row.reason;
                EXPECT_EQ(note.source, row.source) << row.reason;
                EXPECT_EQ(note.text, QString::fromUtf16(row.dropped)) << row.reason;
            }
        }
    }
}

TEST(TagScanner, NotesAnEmptyElementOnlyWhereItEndsAList)
{
    const ScanText text(QStringLiteral("<F>a</F><F></F><F>b</F>"));
    ScanNotes notes;
    NodeSequence sequence(text, u"F", &notes);
    EXPECT_TRUE(sequence.next());
    EXPECT_FALSE(sequence.next());
    ASSERT_EQ(notes.size(), 1U);
    EXPECT_EQ(notes.front().kind, Kind::EmptyEndsList);
    EXPECT_EQ(notes.front().source, 8);

    ScanNotes none;
    EXPECT_TRUE(GetNode(ScanText(QStringLiteral("<F></F>")), u"F", &none).exists());
    EXPECT_TRUE(none.empty());
}

TEST(TagScanner, NotesNothingAsDroppedWhereNothingIsCutOut)
{
    ScanText text(QStringLiteral("<F>a</>x"));
    ScanNotes notes;
    EXPECT_EQ(GetNode(text, u"F", &notes).value.text(), QStringLiteral("a"));
    EXPECT_EQ(ExtractNode(text, u"F", false, &notes).value.text(), QStringLiteral("a"));
    EXPECT_TRUE(notes.empty()) << "the x is still there for who reads the text next";
}

} // namespace

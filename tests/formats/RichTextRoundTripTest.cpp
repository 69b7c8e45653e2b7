#include "RichTextDescription.h"
#include "RichTextWriter.h"

#include <QBuffer>
#include <QTextCursor>

#include <random>

using richtext::described;

namespace
{

QByteArray written(const QTextDocument &document)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    EXPECT_TRUE(kareport::writeRichText(buffer, document));
    return buffer.data();
}

void expectSame(const QTextDocument &document, const std::string &reason)
{
    const QByteArray bytes = written(document);
    QTextDocument fromBytes;
    ASSERT_FALSE(kareport::readRichText(QByteArrayView(bytes), fromBytes)) << reason;
    ASSERT_EQ(described(fromBytes), described(document)) << reason << "\n" << bytes.constData();
    QTextDocument fromText;
    ASSERT_FALSE(kareport::readRichText(QString::fromLatin1(bytes), fromText)) << reason;
    ASSERT_EQ(described(fromText), described(document)) << reason;
    ASSERT_EQ(written(fromBytes), written(fromText)) << reason;
    ASSERT_EQ(written(document), bytes) << reason << ": the same bytes each time";
}

QTextCharFormat plain()
{
    QTextCharFormat format;
    format.setFontFamilies({QStringLiteral("Lucida Console")});
    format.setFontPointSize(9);
    return format;
}

TEST(RichTextRoundTrip, EveryFormatOfCharacters)
{
    struct FormatRow
    {
        void (*set)(QTextCharFormat &);
        const char *reason;
    };
    constexpr FormatRow rows[] = {
        {[](QTextCharFormat &) {}, "nothing special"},
        {[](QTextCharFormat &f) { f.setFontWeight(QFont::Bold); }, "bold"},
        {[](QTextCharFormat &f) { f.setFontItalic(true); }, "italic"},
        {[](QTextCharFormat &f) { f.setFontStrikeOut(true); }, "struck out"},
        {[](QTextCharFormat &f) { f.setUnderlineStyle(QTextCharFormat::SingleUnderline); }, "underlined"},
        {[](QTextCharFormat &f) { f.setUnderlineStyle(QTextCharFormat::DashUnderline); }, "dashes"},
        {[](QTextCharFormat &f) { f.setUnderlineStyle(QTextCharFormat::DotLine); }, "dots"},
        {[](QTextCharFormat &f) { f.setUnderlineStyle(QTextCharFormat::DashDotLine); }, "dash and dot"},
        {[](QTextCharFormat &f) { f.setUnderlineStyle(QTextCharFormat::DashDotDotLine); }, "dash, dot, dot"},
        {[](QTextCharFormat &f) { f.setUnderlineStyle(QTextCharFormat::WaveUnderline); }, "waves"},
        {[](QTextCharFormat &f) { f.setVerticalAlignment(QTextCharFormat::AlignSuperScript); }, "above"},
        {[](QTextCharFormat &f) { f.setVerticalAlignment(QTextCharFormat::AlignSubScript); }, "below"},
        {[](QTextCharFormat &f) { f.setFontCapitalization(QFont::AllUppercase); }, "capitals"},
        {[](QTextCharFormat &f) { f.setFontCapitalization(QFont::SmallCaps); }, "small capitals"},
        {[](QTextCharFormat &f) { f.setForeground(QColor(1, 2, 3)); }, "colour"},
        {[](QTextCharFormat &f) { f.setForeground(QColor(Qt::white)); }, "white"},
        {[](QTextCharFormat &f) { f.setBackground(QColor(Qt::yellow)); }, "behind the text"},
        {[](QTextCharFormat &f) { f.setFontFamilies({QStringLiteral("Ünïcode 測量")}); }, "font"},
        {[](QTextCharFormat &f) { f.setFontStyleHint(QFont::Monospace); }, "kind of font"},
        {[](QTextCharFormat &f) { f.setFontPointSize(10.5); }, "half a point"},
        {[](QTextCharFormat &f) { f.setFontPointSize(1000); }, "a large size"},
    };
    QTextDocument all;
    QTextCursor cursor(&all);
    for (const FormatRow &row : rows) {
        QTextCharFormat format = plain();
        row.set(format);
        QTextDocument one;
        QTextCursor(&one).insertText(QStringLiteral("text"), format);
        expectSame(one, row.reason);
        cursor.insertText(QStringLiteral("text"), format);
    }
    expectSame(all, "all in one paragraph");
}

TEST(RichTextRoundTrip, EveryFormatOfParagraphs)
{
    struct FormatRow
    {
        void (*set)(QTextBlockFormat &);
        const char *reason;
    };
    constexpr FormatRow rows[] = {
        {[](QTextBlockFormat &) {}, "nothing special"},
        {[](QTextBlockFormat &f) { f.setAlignment(Qt::AlignRight); }, "right"},
        {[](QTextBlockFormat &f) { f.setAlignment(Qt::AlignHCenter); }, "centred"},
        {[](QTextBlockFormat &f) { f.setAlignment(Qt::AlignJustify); }, "justified"},
        {[](QTextBlockFormat &f) { f.setLeftMargin(17); }, "left"},
        {[](QTextBlockFormat &f) { f.setRightMargin(18.2); }, "right, in twips"},
        {[](QTextBlockFormat &f) { f.setTextIndent(-19); }, "first line"},
        {[](QTextBlockFormat &f) { f.setTopMargin(20); }, "above"},
        {[](QTextBlockFormat &f) { f.setBottomMargin(21); }, "below"},
        {[](QTextBlockFormat &f) { f.setLineHeight(150, QTextBlockFormat::ProportionalHeight); }, "lines and a half"},
        {[](QTextBlockFormat &f) { f.setLineHeight(30, QTextBlockFormat::FixedHeight); }, "exactly"},
        {[](QTextBlockFormat &f) { f.setLineHeight(31, QTextBlockFormat::MinimumHeight); }, "at least"},
        {[](QTextBlockFormat &f) { f.setBackground(QColor(Qt::lightGray)); }, "behind the paragraph"},
        {[](QTextBlockFormat &f) { f.setPageBreakPolicy(QTextFormat::PageBreak_AlwaysBefore); }, "on a new page"},
        {[](QTextBlockFormat &f) { f.setLayoutDirection(Qt::RightToLeft); }, "from right to left"},
        {[](QTextBlockFormat &f) {
             f.setLeftMargin(10);
             f.setTabPositions(
                 {QTextOption::Tab(100, QTextOption::LeftTab), QTextOption::Tab(200, QTextOption::RightTab),
                  QTextOption::Tab(300, QTextOption::CenterTab), QTextOption::Tab(400, QTextOption::DelimiterTab)});
         },
         "tab stops"},
    };
    QTextDocument all;
    QTextCursor cursor(&all);
    for (const FormatRow &row : rows) {
        QTextBlockFormat format;
        row.set(format);
        QTextDocument one;
        QTextCursor oneCursor(&one);
        oneCursor.setBlockFormat(format);
        oneCursor.insertText(QStringLiteral("text"), plain());
        expectSame(one, row.reason);
        cursor.insertBlock(format, plain());
        cursor.insertText(QStringLiteral("text"), plain());
        cursor.insertBlock(format, plain());
    }
    expectSame(all, "all, with empty paragraphs");
}

TEST(RichTextRoundTrip, APageEndAfterAParagraphIsOneBeforeTheNext)
{
    QTextDocument document;
    QTextCursor cursor(&document);
    QTextBlockFormat format;
    format.setPageBreakPolicy(QTextFormat::PageBreak_AlwaysAfter);
    cursor.setBlockFormat(format);
    cursor.insertText(QStringLiteral("a"), plain());
    cursor.insertBlock(QTextBlockFormat(), plain());
    cursor.insertText(QStringLiteral("b"), plain());
    EXPECT_EQ(richtext::shown(written(document)), QStringLiteral("<Lucida Console 9pt>a|[page]<Lucida Console 9pt>b"));
}

TEST(RichTextRoundTrip, AnEmptyParagraphKeepsTheHeightOfItsLine)
{
    QTextDocument document;
    QTextCursor cursor(&document);
    cursor.insertText(QStringLiteral("a"), plain());
    QTextCharFormat large = plain();
    large.setFontPointSize(30);
    cursor.insertBlock(QTextBlockFormat(), large);
    cursor.insertBlock(QTextBlockFormat(), plain());
    cursor.insertText(QStringLiteral("b"), plain());
    QTextDocument read;
    ASSERT_FALSE(kareport::readRichText(QByteArrayView(written(document)), read));
    EXPECT_EQ(read.findBlockByNumber(1).charFormat().fontPointSize(), 30);
    EXPECT_EQ(read.findBlockByNumber(2).charFormat().fontPointSize(), 9);
}

class RandomDocument
{
public:
    explicit RandomDocument(unsigned seed) : engine_(seed) {}

    void fill(QTextDocument &document)
    {
        QTextCursor cursor(&document);
        cursor.setBlockFormat(blockFormat());
        const unsigned pieces = random() % 12;
        for (unsigned i = 0; i < pieces; ++i) {
            cursor.insertText(text(), format());
            if (random() % 3 == 0) {
                cursor.insertBlock(blockFormat(), format());
            }
        }
    }

private:
    bool rarely() { return random() % 4 == 0; }

    QString text()
    {
        QString text;
        const unsigned length = random() % 20;
        for (unsigned i = 0; i < length; ++i) {
            text += character();
        }
        return text;
    }

    QString character()
    {
        constexpr char16_t special[] = {u'\\', u'{', u'}', u'\t', 0x2028, u'\'', u'*',
                                        u';',  u' ', u'-', u'0',  0xA0,   0xAD};
        switch (random() % 7) {
        case 0: return QChar(special[random() % std::size(special)]);
        case 1: return QChar(char16_t(0x80 + random() % 0x80));
        case 2: return QChar(char16_t(0x4E00 + random() % 0x5000));
        case 3: {
            const char32_t code = 0x10000 + random() % 0x100000;
            return QString::fromUcs4(&code, 1);
        }
        case 4: {
            // Control characters that neither end a paragraph nor show nothing at all.
            const auto code = char16_t(1 + random() % 0x1F);
            return code == u'\n' || code == u'\r' ? QString() : QString(QChar(code));
        }
        case 5: {
            const auto code = char16_t(0x100 + random() % 0xFE00);
            const bool parts = code == QChar::ParagraphSeparator || code == QChar::ObjectReplacementCharacter ||
                               code == 0xFDD0 || code == 0xFDD1;
            return parts ? QString() : QString(QChar(code));
        }
        default: return QChar(char16_t(u'a' + random() % 26));
        }
    }

    QTextCharFormat format()
    {
        QTextCharFormat format;
        format.setFontFamilies({QStringLiteral("Font %1").arg(random() % 3)});
        format.setFontPointSize(double(1 + random() % 60) / 2);
        if (rarely()) {
            format.setFontWeight(QFont::Bold);
        }
        if (rarely()) {
            format.setFontItalic(true);
        }
        if (rarely()) {
            format.setUnderlineStyle(static_cast<QTextCharFormat::UnderlineStyle>(random() % 7));
        }
        if (rarely()) {
            format.setForeground(QColor(QRgb(random() % 0x1000000)));
        }
        if (rarely()) {
            format.setBackground(QColor(QRgb(random() % 0x1000000)));
        }
        if (rarely()) {
            format.setVerticalAlignment(static_cast<QTextCharFormat::VerticalAlignment>(random() % 3));
        }
        return format;
    }

    QTextBlockFormat blockFormat()
    {
        constexpr Qt::AlignmentFlag alignments[] = {Qt::AlignLeft, Qt::AlignRight, Qt::AlignHCenter, Qt::AlignJustify};
        QTextBlockFormat format;
        format.setAlignment(alignments[random() % 4]);
        if (rarely()) {
            format.setLeftMargin(double(random() % 3000) / 15);
            format.setTextIndent(double(random() % 3000) / 15 - 100);
        }
        if (rarely()) {
            format.setTopMargin(random() % 30);
            format.setBottomMargin(random() % 30);
        }
        if (rarely()) {
            format.setTabPositions({QTextOption::Tab(random() % 500, static_cast<QTextOption::TabType>(random() % 4))});
        }
        if (rarely()) {
            format.setPageBreakPolicy(QTextFormat::PageBreak_AlwaysBefore);
        }
        return format;
    }

    unsigned random() { return static_cast<unsigned>(engine_()); }

    std::mt19937 engine_;
};

TEST(RichTextRoundTrip, RandomDocumentsComeBackAsTheyWere)
{
    for (unsigned seed = 1; seed <= 1500; ++seed) {
        QTextDocument document;
        RandomDocument(seed).fill(document);
        expectSame(document, "seed " + std::to_string(seed));
        if (HasFatalFailure()) {
            break;
        }
    }
}

} // namespace

#include "RichTextWriter.h"
#include "RichTextDescription.h"

#include <QBuffer>
#include <QTextCursor>
#include <QTextTable>

#include <algorithm>

namespace
{

QByteArray written(const QTextDocument &document)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    EXPECT_TRUE(kareport::writeRichText(buffer, document));
    return buffer.data();
}

QTextCharFormat plain()
{
    QTextCharFormat format;
    format.setFontFamilies({QStringLiteral("Mono")});
    format.setFontPointSize(9);
    return format;
}

/// What is written of a text after the tables.
QByteArray writtenText(const QString &text)
{
    QTextDocument document;
    QTextCursor(&document).insertText(text, plain());
    const QByteArray bytes = written(document);
    return bytes.sliced(bytes.indexOf("\\pard"));
}

TEST(RichTextWriter, WritesAWholeFile)
{
    QTextDocument document;
    document.setDefaultFont(QFont(QStringLiteral("Default"), 10));
    QTextCursor cursor(&document);
    cursor.insertText(QStringLiteral("Point 1\n"), plain());
    QTextCharFormat bold = plain();
    bold.setFontWeight(QFont::Bold);
    bold.setForeground(QColor(255, 0, 0));
    cursor.insertText(QStringLiteral("12°"), bold);
    EXPECT_EQ(written(document), QByteArray("{\\rtf1\\ansi\\ansicpg1252\\deff0\\uc1\r\n"
                                            "{\\fonttbl{\\f0\\fnil\\fcharset0 Default;}\r\n"
                                            "{\\f1\\fnil\\fcharset0 Mono;}\r\n}\r\n"
                                            "{\\colortbl;\\red255\\green0\\blue0;\r\n}\r\n"
                                            "\\pard\\plain\\f1\\fs18 Point 1\\par\r\n"
                                            "\\plain\\f1\\fs18\\b\\cf1 12\\'b0\\par\r\n}\r\n"));
}

TEST(RichTextWriter, WritesCharactersInSevenBits)
{
    struct TextRow
    {
        QString text;
        QByteArray expected;
        const char *reason;
    };
    const char16_t control[] = {u'a', 0x01, 0x1F, 0x7F, 0x80, 0x9F, u'\0', u'b'};
    const char16_t halves[] = {0xDE00, u'x', 0xD83D};
    const TextRow rows[] = {
        {QStringLiteral("a{b}c\\d"), "a\\{b\\}c\\\\d", "what has a meaning is escaped"},
        {QStringLiteral("a\tb"), "a\\tab b", "a tab"},
        {QStringLiteral("a\u2028 b"), "a\\line  b", "a line end in the paragraph; the blank after it is text"},
        {QStringLiteral("\u00A0°ÿ\u00AD"), "\\'a0\\'b0\\'ff\\'ad", "what code page 1252 has at its own place"},
        {QStringView(control, 8).toString(), "a\\'01\\'1f\\'7f\\u128?\\u159?b",
         "control characters; a zero is left out"},
        {QStringLiteral("€測"), "\\u8364?\\u28204?", "other characters"},
        {QStringLiteral("\u7FFF\u8000\uFFFF"), "\\u32767?\\u-32768?\\u-1?", "numbers are signed"},
        {QStringLiteral("😀1"), "\\u-10179?\\u-8704?1", "both halves of a pair; the digit is text"},
        {QStringView(halves, 3).toString(), "\\u-8704?x\\u-10179?", "halves without the other one"},
        {QStringLiteral("a1 -2"), "a1 -2", "nothing special"},
    };
    for (const TextRow &row : rows) {
        EXPECT_EQ(writtenText(row.text), "\\pard\\plain\\f1\\fs18 " + row.expected + "\\par\r\n}\r\n") << row.reason;
    }
    EXPECT_EQ(written(QTextDocument(QStringLiteral("測"))).indexOf('\xE6'), -1);
}

TEST(RichTextWriter, NamesOfFontsAreEscaped)
{
    QTextDocument document;
    QTextCharFormat format = plain();
    format.setFontFamilies({QStringLiteral("Ｆ;{\\")});
    QTextCursor(&document).insertText(QStringLiteral("x"), format);
    const QByteArray bytes = written(document);
    EXPECT_TRUE(bytes.contains("{\\f1\\fnil\\fcharset0 \\u-218?\\'3b\\{\\\\;}")) << bytes.constData();
    EXPECT_EQ(richtext::shown(bytes), QStringLiteral("<Ｆ;{\\ 9pt>x"));
}

TEST(RichTextWriter, AnEmptyDocumentIsOneParagraph)
{
    const QByteArray bytes = written(QTextDocument());
    EXPECT_TRUE(bytes.endsWith("\\par\r\n}\r\n"));
    EXPECT_EQ(bytes.count("\\par\r"), 1);
    EXPECT_EQ(richtext::shown(bytes), QString());
}

TEST(RichTextWriter, FontAndSizeOfTheDocumentAreWrittenWhereATextHasNone)
{
    QTextDocument document;
    QFont font(QStringLiteral("Default"));
    font.setPixelSize(20);
    document.setDefaultFont(font);
    document.setPlainText(QStringLiteral("x"));
    EXPECT_EQ(richtext::shown(written(document)), QStringLiteral("<Default 15pt>x")) << "96 pixels are 72 points";
}

TEST(RichTextWriter, TablesBecomeParagraphsAndPicturesAreLeftOut)
{
    QTextDocument document;
    QTextCursor cursor(&document);
    cursor.insertTable(1, 2)->cellAt(0, 1).firstCursorPosition().insertText(QStringLiteral("B"), plain());
    cursor.movePosition(QTextCursor::End);
    cursor.insertText(QStringLiteral("x"), plain());
    cursor.insertImage(QStringLiteral("picture.png"));
    cursor.insertText(QStringLiteral("y"), plain());
    QString text = richtext::shown(written(document));
    EXPECT_TRUE(text.endsWith(QStringLiteral("xy"))) << text.toStdString();
    EXPECT_TRUE(text.contains(QStringLiteral(">B|"))) << text.toStdString();
}

TEST(RichTextWriter, LongTextsAreWrittenInPiecesWithoutASeam)
{
    constexpr qsizetype piece = 65536;
    for (qsizetype at = piece - 2; at <= piece + 1; ++at) {
        const QByteArray bytes = writtenText(QString(at, u'a') + QStringLiteral("😀") + QString(piece, u'b'));
        EXPECT_TRUE(bytes.contains("aaa\\u-10179?\\u-8704?bbb")) << at;
        EXPECT_EQ(bytes.count('b'), piece) << at;
    }
}

TEST(RichTextWriter, LinesStayShortAndFollowTheParagraphs)
{
    QString text;
    for (int i = 0; i < 1000; ++i) {
        text += QString(80, u'x') + u'\n';
    }
    const QList<QByteArray> lines = writtenText(text).split('\n');
    EXPECT_EQ(lines.size(), 1003);
    for (const QByteArray &line : lines) {
        EXPECT_LE(line.size(), 120);
    }
}

/// A device that takes so many bytes and no more.
class FullDevice : public QIODevice
{
public:
    explicit FullDevice(qint64 room) : room_(room) { open(QIODevice::WriteOnly | QIODevice::Unbuffered); }

protected:
    qint64 readData(char *, qint64) override { return -1; }
    qint64 writeData(const char *, qint64 size) override
    {
        const qint64 taken = std::min(size, room_);
        room_ -= taken;
        return taken == 0 && size > 0 ? -1 : taken;
    }

private:
    qint64 room_;
};

TEST(RichTextWriter, AFailedWriteIsAnswered)
{
    for (const int lines : {1, 20000}) {
        QTextDocument document;
        QTextCursor(&document).insertText(QStringLiteral("one line of a report\n").repeated(lines), plain());
        const qint64 size = written(document).size();
        for (const qint64 room : {qint64(0), qint64(10), size / 2, size - 1}) {
            FullDevice device(room);
            EXPECT_FALSE(kareport::writeRichText(device, document)) << room << " of " << size;
        }
        FullDevice device(size);
        EXPECT_TRUE(kareport::writeRichText(device, document));
    }
}

} // namespace

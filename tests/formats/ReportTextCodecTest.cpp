#include "ReportTextCodec.h"

#include "PrintQt.h"

#include <QBuffer>

#include <gtest/gtest.h>

#include <random>
#include <vector>

namespace
{

using kareport::LineEnds;
using kareport::ReportTextEncoder;

QByteArray written(QStringView text, LineEnds lineEnds)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    EXPECT_TRUE(kareport::writeReportText(buffer, text, lineEnds));
    return buffer.data();
}

std::string hex(const QByteArray &bytes)
{
    return bytes.toHex(' ').toStdString();
}

/// Encodes the piece and checks that it stays within the room it asks for.
QByteArray encoded(ReportTextEncoder &encoder, QStringView piece, bool last)
{
    const std::size_t bound = ReportTextEncoder::bound(static_cast<std::size_t>(piece.size()));
    std::vector<char> bytes(bound + 8, '\x55');
    const std::size_t size = encoder.encode(piece, bytes.data(), last);
    EXPECT_LE(size, bound);
    for (std::size_t i = bound; i < bytes.size(); ++i) {
        EXPECT_EQ(bytes[i], '\x55') << "written past the room for the piece";
    }
    return QByteArray(bytes.data(), static_cast<qsizetype>(size));
}

/// The same rules, one code point at a time.
QByteArray expectedBytes(QStringView text, LineEnds lineEnds)
{
    QByteArray bytes;
    const auto put = [&](unsigned value) { bytes.append(static_cast<char>(value)); };
    for (qsizetype i = 0; i < text.size(); ++i) {
        unsigned code = text[i].unicode();
        const unsigned next = i + 1 < text.size() ? text[i + 1].unicode() : 0;
        if (code >= 0xD800 && code < 0xDC00 && next >= 0xDC00 && next < 0xE000) {
            code = 0x10000 + ((code - 0xD800) << 10) + (next - 0xDC00);
            ++i;
        } else if (code >= 0xD800 && code < 0xE000) {
            code = 0xFFFD;
        }
        if (code == '\n' && lineEnds == LineEnds::ReportFile) {
            put('\r');
        }
        if (code == '\r' && next == '\n' && lineEnds == LineEnds::PlainText) {
            continue;
        }
        if (code < 0x80) {
            put(code);
        } else if (code < 0x800) {
            put(0xC0 | code >> 6);
            put(0x80 | (code & 0x3F));
        } else if (code < 0x10000) {
            put(0xE0 | code >> 12);
            put(0x80 | (code >> 6 & 0x3F));
            put(0x80 | (code & 0x3F));
        } else {
            put(0xF0 | code >> 18);
            put(0x80 | (code >> 12 & 0x3F));
            put(0x80 | (code >> 6 & 0x3F));
            put(0x80 | (code & 0x3F));
        }
    }
    return bytes;
}

struct Row
{
    QStringView text;
    const char *expected;
    const char *reason;
};

TEST(ReportTextCodec, AReportFileIsMarkedUtf8WithEveryLineFeedAsCrLf)
{
    const Row rows[] = {
        {u"A\r\nB\r\n", "ef bb bf 41 0d 0d 0a 42 0d 0d 0a", "the two lines of a report end with CR CR LF"},
        {u"", "ef bb bf", "the mark alone"},
        {u"\n", "ef bb bf 0d 0a", "a line feed alone"},
        {u"\r", "ef bb bf 0d", "a carriage return alone stays alone"},
        {u"\n\r\r\n", "ef bb bf 0d 0a 0d 0d 0d 0a", "out of order"},
        {QStringView(u"\0A", 2), "ef bb bf 00 41", "a character 0 does not end the text"},
        {u"\x7F\x80", "ef bb bf 7f c2 80", "one byte becomes two"},
        {u"\x7FF\x800", "ef bb bf df bf e0 a0 80", "two bytes become three"},
        {u"\xFFFF", "ef bb bf ef bf bf", "the last of three bytes"},
        {u"\xD800\xDC00", "ef bb bf f0 90 80 80", "the first of four bytes"},
        {u"\xDBFF\xDFFF", "ef bb bf f4 8f bf bf", "the last character of all"},
        {u"\xFEFF", "ef bb bf ef bb bf", "a mark inside the text is text"},
        {u"12\xB0 \x6E2C\x91CF", "ef bb bf 31 32 c2 b0 20 e6 b8 ac e9 87 8f", "degrees and CJK"},
        {u"\xD83D\xDE00", "ef bb bf f0 9f 98 80", "a surrogate pair"},
        {u"\xD83D", "ef bb bf ef bf bd", "a high surrogate at the end"},
        {u"\xDE00", "ef bb bf ef bf bd", "a low surrogate alone"},
        {u"\xDE00\xD83D", "ef bb bf ef bf bd ef bf bd", "a pair the wrong way round"},
        {u"\xD83D\xD83D\xDE00", "ef bb bf ef bf bd f0 9f 98 80", "a high surrogate before a pair"},
        {u"\xD83D\xDE00\xDE00", "ef bb bf f0 9f 98 80 ef bf bd", "a low surrogate after a pair"},
        {u"\xD83D\r\n", "ef bb bf ef bf bd 0d 0d 0a", "a high surrogate before a line end"},
        {u"\xD83D"
         u"A",
         "ef bb bf ef bf bd 41", "a high surrogate before a letter"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(hex(written(row.text, LineEnds::ReportFile)), row.expected) << row.reason;
    }
}

TEST(ReportTextCodec, PlainTextIsUtf8WithoutMarkAndWithCrLfAsLf)
{
    const Row rows[] = {
        {u"A\r\nB\r\n", "41 0a 42 0a", "two lines"},
        {u"", "", "nothing at all"},
        {u"\r", "0d", "a carriage return at the end"},
        {u"A\rB", "41 0d 42", "a carriage return alone"},
        {u"\r\r\n", "0d 0a", "only the one before the line feed goes"},
        {u"\r\n\r\n", "0a 0a", "an empty line"},
        {u"\n\r", "0a 0d", "the wrong way round"},
        {u"\n", "0a", "a line feed alone"},
        {u"\r\xD83D\xDE00\r", "0d f0 9f 98 80 0d", "around a surrogate pair"},
        {u"\xD83D\r\n\xDE00", "ef bf bd 0a ef bf bd", "a line end between two halves"},
        {u"\xFEFF", "ef bb bf", "a mark in the text stays"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(hex(written(row.text, LineEnds::PlainText)), row.expected) << row.reason;
    }
}

TEST(ReportTextCodec, ASpecialCharacterIsFoundAtEveryPlaceOfALongLine)
{
    for (const QStringView special :
         {QStringView(u"\r\n"), QStringView(u"\n"), QStringView(u"\r"), QStringView(u"\xB0"),
          QStringView(u"\xD83D\xDE00"), QStringView(u"\xDE00"), QStringView(u"\xD83D")})
    {
        for (qsizetype at = 0; at <= 50; ++at) {
            const QString text = QString(at, u'a') + special.toString() + QString(50 - at, u'b');
            for (const LineEnds lineEnds : {LineEnds::ReportFile, LineEnds::PlainText}) {
                ReportTextEncoder encoder(lineEnds);
                EXPECT_EQ(hex(encoded(encoder, text, true)), hex(expectedBytes(text, lineEnds))) << at;
            }
        }
    }
}

TEST(ReportTextCodec, PiecesGiveTheBytesOfTheWholeText)
{
    constexpr char16_t alphabet[] = {u'a', u'b', u'\r', u'\n', u'\0', 0xB0, 0x6E2C, 0xD83D, 0xDE00, 0xFFFF};
    std::mt19937 random(20240305);
    for (int round = 0; round < 400; ++round) {
        QString text(static_cast<qsizetype>(random() % 48), u' ');
        for (QChar &character : text) {
            // Long plain runs as well as many special characters.
            character = round % 2 == 0 || random() % 12 == 0 ? QChar(alphabet[random() % std::size(alphabet)]) : u'x';
        }
        for (const LineEnds lineEnds : {LineEnds::ReportFile, LineEnds::PlainText}) {
            const std::string expected = hex(expectedBytes(text, lineEnds));
            ReportTextEncoder whole(lineEnds);
            ASSERT_EQ(hex(encoded(whole, text, true)), expected) << testing::PrintToString(text);
            for (qsizetype cut = 0; cut <= text.size(); ++cut) {
                ReportTextEncoder encoder(lineEnds);
                QByteArray bytes = encoded(encoder, QStringView(text).first(cut), false);
                bytes += encoded(encoder, QStringView(text).sliced(cut), true);
                ASSERT_EQ(hex(bytes), expected) << testing::PrintToString(text) << " cut at " << cut;
            }
            ReportTextEncoder encoder(lineEnds);
            QByteArray bytes;
            for (qsizetype i = 0; i < text.size(); ++i) {
                bytes += encoded(encoder, QStringView(text).sliced(i, 1), false);
                bytes += encoded(encoder, QStringView(), false);
            }
            bytes += encoded(encoder, QStringView(), true);
            ASSERT_EQ(hex(bytes), expected) << testing::PrintToString(text) << " character by character";
        }
    }
}

TEST(ReportTextCodec, LongTextsAreWrittenInPiecesWithoutASeam)
{
    constexpr qsizetype piece = 65536;
    for (const QStringView special : {QStringView(u"\r\n"), QStringView(u"\xD83D\xDE00"), QStringView(u"\xD83D")}) {
        for (qsizetype at = piece - 3; at <= piece + 1; ++at) {
            const QString text = QString(at, u'a') + special.toString() + QString(piece, u'b');
            EXPECT_TRUE(written(text, LineEnds::PlainText) == expectedBytes(text, LineEnds::PlainText)) << at;
            EXPECT_TRUE(written(text, LineEnds::ReportFile) ==
                        "\xEF\xBB\xBF" + expectedBytes(text, LineEnds::ReportFile))
                << at;
        }
    }
    const QString endsWithReturn = QString(piece - 1, u'a') + u'\r';
    EXPECT_TRUE(written(endsWithReturn, LineEnds::PlainText) == endsWithReturn.toLatin1());
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

TEST(ReportTextCodec, AFailedWriteIsAnswered)
{
    struct WriteRow
    {
        qsizetype size;
        LineEnds lineEnds;
        qint64 room;
        bool expected;
        const char *reason;
    };
    constexpr WriteRow rows[] = {
        {1, LineEnds::ReportFile, 0, false, "no room for the mark"},
        {1, LineEnds::ReportFile, 2, false, "room for a part of the mark"},
        {1, LineEnds::ReportFile, 3, false, "room for the mark only"},
        {1, LineEnds::ReportFile, 4, true, "just enough room"},
        {10, LineEnds::PlainText, 9, false, "the last byte does not fit"},
        {10, LineEnds::PlainText, 10, true, "just enough room"},
        {0, LineEnds::PlainText, 0, true, "nothing needs no room"},
        {200000, LineEnds::PlainText, 100000, false, "full in the middle of a long text"},
        {200000, LineEnds::PlainText, 199999, false, "full at the end of a long text"},
        {200000, LineEnds::PlainText, 200000, true, "just enough room for a long text"},
    };
    for (const WriteRow &row : rows) {
        FullDevice device(row.room);
        EXPECT_EQ(kareport::writeReportText(device, QString(row.size, u'a'), row.lineEnds), row.expected) << row.reason;
    }
}

} // namespace

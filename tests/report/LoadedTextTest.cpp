#include "LoadedText.h"

#include "FailingMemory.h"
#include "PageHeader.h"
#include "PrintQt.h"
#include "ReportTextCodec.h"
#include "ReportTextDecoder.h"

#include <QRandomGenerator>

#include <gtest/gtest.h>

namespace
{

using kareport::LoadedText;
using kareport::loadPlainText;
using kareport::loadReportText;
using kareport::TextLoading;

const QByteArray mark = QByteArrayLiteral("\xEF\xBB\xBF");

QString all(const LoadedText &loaded)
{
    return loaded.text.piece(0, loaded.text.size());
}

/// The report text of a file as it was written.
QString written(const QByteArray &bytes)
{
    QString text;
    EXPECT_FALSE(kareport::decodeReportText(bytes, text).has_value());
    return text;
}

TEST(LoadedText, IsWhatTheDecoderGives)
{
    struct Row
    {
        QByteArray bytes;
        const char *reason;
    };
    const Row rows[] = {
        {"", "an empty file"},
        {mark, "only the mark"},
        {mark + "A\r\r\nB\r\r\n", "as reports are saved"},
        {mark + "A\r\nB", "an editor wrote it"},
        {mark + "A\r\nB\r\r\n", "a bare LF of the text was written as CR LF"},
        {mark + "A\nB\r\r\nC\r\r\r\r\n", "line ends of every kind"},
        {mark + "A\rB\r", "a CR alone is a character, at the end as well"},
        {mark + "A\r", "no line end at all"},
        {mark + mark + "A", "a second mark is a character"},
        {mark + "\xC3\xA9\xE2\x88\x9E\xF0\x9F\x98\x80\r\r\n", "two, three and four bytes"},
        {"A\nB\r\nC\r\r\nD", "a text of another program"},
        {QByteArray("a\0b\n", 4), "a NUL is a character"},
    };
    for (const Row &row : rows) {
        LoadedText loaded;
        EXPECT_EQ(loadReportText(row.bytes, loaded), TextLoading::Whole) << row.reason;
        EXPECT_EQ(all(loaded), written(row.bytes)) << row.reason;
        EXPECT_EQ(loaded.lineEnds, written(row.bytes).count(u'\n')) << row.reason;
    }
}

TEST(LoadedText, IsTheSameInPieces)
{
    // Lines of every length around the ends of pieces; characters of more bytes come in some pieces only.
    const QByteArray parts[] = {
        "a",  "line of a report ", "\r",           "\r\r\n",          "\r\n", "\n", "\r\r\n", "\r\r\n",
        mark, "\xC3\xA9",          "\xE2\x88\x9E", "\xF0\x9F\x98\x80"};
    QRandomGenerator random(31);
    for (int round = 0; round < 20; ++round) {
        QByteArray bytes = round % 2 == 0 ? mark : QByteArray();
        while (bytes.size() < 700'000) {
            const int count = random.bounded(4) == 0 ? 12 : 8; // of the parts that may come
            const QByteArray line = parts[random.bounded(count)] + parts[random.bounded(8)];
            bytes += line.repeated(random.bounded(2000));
            bytes += parts[3];
        }
        LoadedText loaded;
        ASSERT_EQ(loadReportText(bytes, loaded), TextLoading::Whole) << round;
        const QString expected = written(bytes);
        EXPECT_TRUE(all(loaded) == expected) << round;
        EXPECT_EQ(loaded.lineEnds, expected.count(u'\n')) << round;
    }
}

TEST(LoadedText, KeepsOneByteACharacterAsLongAsThatIsEnough)
{
    LoadedText narrow;
    ASSERT_EQ(loadReportText(mark + "h\xC3\xB6he\r\r\n", narrow), TextLoading::Whole);
    EXPECT_TRUE(narrow.text.isNarrow());
    LoadedText wide;
    ASSERT_EQ(loadReportText(mark + "\xE2\x88\x9E\r\r\n", wide), TextLoading::Whole);
    EXPECT_FALSE(wide.text.isNarrow());
}

TEST(LoadedText, IsAnotherTextWhereItIsNotUtf8OrIsRichText)
{
    const QByteArray lines = QByteArray("a line\r\r\n").repeated(60'000);
    struct Row
    {
        QByteArray bytes;
        const char *reason;
    };
    const Row rows[] = {
        {"caf\xE9", "Latin-1"},
        {mark + lines + "caf\xE9\r\r\n" + lines, "in a later piece"},
        {mark + lines + "\xE2\x88", "cut off in the middle of a character"},
        {"{\\rtf1 a}", "rich text"},
        {mark + "{\\rtf1 a}", "rich text after a mark"},
    };
    for (const Row &row : rows) {
        LoadedText loaded;
        EXPECT_EQ(loadReportText(row.bytes, loaded), TextLoading::OtherText) << row.reason;
    }
}

TEST(LoadedText, KnowsItsPages)
{
    const QString header = kareport::pageHeaderLine(QStringLiteral("TALVEN"), QStringLiteral("R"),
                                                    QDateTime::currentDateTime(), QStringLiteral("   Page:"), 80);
    QString text;
    for (int page = 1; page <= 4; ++page) {
        text += header + QString::number(page).rightJustified(3) + QStringLiteral("\r\n");
        text += QStringLiteral("x\r\n").repeated(page == 2 ? 3 : 9);
    }
    for (const QString &more : {QString(), QStringLiteral("∞\r\n")}) {
        LoadedText loaded;
        ASSERT_EQ(loadReportText((text + more).toUtf8(), loaded), TextLoading::Whole);
        EXPECT_EQ(loaded.pageStarts, kareport::pageHeadersIn(QStringView(text)));
        EXPECT_EQ(loaded.pageStarts.size(), 4U);
        EXPECT_EQ(loaded.linesPerPage, 10) << "what most pages have";
        LoadedText plain;
        ASSERT_EQ(loadPlainText((text + more).toUtf8(), plain), TextLoading::Whole);
        EXPECT_EQ(plain.pageStarts, loaded.pageStarts);
    }
    LoadedText source;
    ASSERT_EQ(loadPlainText("{\\rtf1 a}\r\n" + text.toUtf8(), source), TextLoading::Whole);
    EXPECT_TRUE(source.pageStarts.empty()) << "the lines of a source are not those that it shows";
}

TEST(LoadedText, StopsWhenItIsNotWaitedFor)
{
    const QByteArray bytes = mark + QByteArray("a line\r\r\n").repeated(200'000);
    qint64 told = 0;
    LoadedText loaded;
    EXPECT_EQ(loadReportText(bytes, loaded,
                             [&told](qint64 done) {
                                 told = done;
                                 return done < 500'000;
                             }),
              TextLoading::Stopped);
    EXPECT_GE(told, 500'000);
    EXPECT_LT(told, 1'000'000) << "at once";
    LoadedText whole;
    EXPECT_EQ(loadReportText(bytes, whole,
                             [&told](qint64 done) {
                                 told = done;
                                 return true;
                             }),
              TextLoading::Whole);
    EXPECT_EQ(told, bytes.size() - mark.size());
}

TEST(LoadedText, IsWholeOrNotThereWhenMemoryEnds)
{
    const QByteArray bytes =
        mark + QByteArray("a line\r\r\n").repeated(100'000) + "\xE2\x88\x9E" + QByteArray("\r\r\n").repeated(100'000);
    int refused = 0;
    for (int request = 1;; ++request) {
        FailingMemory::refuse(0);
        LoadedText loaded{kareport::ReportText(FailingMemory::reallocate)};
        FailingMemory::refuse(request);
        const TextLoading answer = loadReportText(bytes, loaded);
        const bool hasRefused = FailingMemory::hasRefused;
        FailingMemory::refuse(0);
        EXPECT_EQ(answer, hasRefused ? TextLoading::NoMemory : TextLoading::Whole) << request;
        if (!hasRefused) {
            EXPECT_TRUE(all(loaded) == written(bytes));
            break;
        }
        ++refused;
    }
    EXPECT_GE(refused, 2) << "with one byte a character, and with two";
}

TEST(LoadedText, OfPlainTextIsItsUtf8)
{
    const QString text =
        QStringLiteral("a\r\nb\nc\r") + QChar(QChar::ByteOrderMark) + QString::fromUtf8("é∞😀") + QChar(0);
    LoadedText loaded;
    ASSERT_EQ(loadPlainText(text.toUtf8(), loaded), TextLoading::Whole);
    EXPECT_EQ(all(loaded), text);
    LoadedText marked;
    ASSERT_EQ(loadPlainText(mark + "a", marked), TextLoading::Whole);
    EXPECT_EQ(all(marked), QChar(QChar::ByteOrderMark) + QStringLiteral("a")) << "it was a character of the text";
}

} // namespace

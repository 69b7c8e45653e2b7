#include "TextEncoding.h"

#include "SurveyRows.h"

#include <gtest/gtest.h>

namespace
{

using kareport::CsvDialect;
using kareport::TextEncoding;

/// A text as UTF-16 with its mark.
QByteArray utf16(const QString &text, bool isBigEndian)
{
    QByteArray bytes;
    for (const QChar character : QString(QChar(0xFEFF)) + text) {
        const char high = static_cast<char>(character.unicode() >> 8);
        const char low = static_cast<char>(character.unicode() & 0xFF);
        bytes.append(isBigEndian ? high : low).append(isBigEndian ? low : high);
    }
    return bytes;
}

TEST(TextEncoding, HasAKey)
{
    EXPECT_EQ(kareport::textEncodingFromKey(u"utf-8"), TextEncoding::Utf8);
    EXPECT_EQ(kareport::textEncodingFromKey(u"latin-1"), TextEncoding::Latin1);
    EXPECT_EQ(kareport::textEncodingFromKey(u"windows-1252"), TextEncoding::Windows1252);
    EXPECT_EQ(kareport::textEncodingFromKey(u"utf-16"), TextEncoding::Utf16);
    for (const char16_t *key : {u"", u"UTF-8", u"utf8", u"ascii", u"latin1"}) {
        EXPECT_FALSE(kareport::textEncodingFromKey(key)) << QString::fromUtf16(key).toStdString();
    }
}

TEST(TextEncoding, EveryKeyIsListedOnce)
{
    const QStringList keys = kareport::textEncodingKeys();
    EXPECT_EQ(keys.join(u' ').toStdString(), "utf-8 latin-1 windows-1252 utf-16");
    for (const QString &key : keys) {
        EXPECT_TRUE(kareport::textEncodingFromKey(key)) << key.toStdString();
    }
}

TEST(TextEncoding, EveryEncodingReads)
{
    const QString text = QStringLiteral("Number,Description\n1,Größe €\n2,𝄞測\n");
    struct Row
    {
        TextEncoding encoding;
        QByteArray bytes;
        const char *expected;
        const char *reason;
    };
    const Row rows[] = {
        {TextEncoding::Utf8, text.toUtf8(), "number=1 description=Größe €|number=2 description=𝄞測", "UTF-8"},
        {TextEncoding::Utf16, utf16(text, false), "number=1 description=Größe €|number=2 description=𝄞測",
         "low bytes first"},
        {TextEncoding::Utf16, utf16(text, true), "number=1 description=Größe €|number=2 description=𝄞測",
         "high bytes first"},
        {TextEncoding::Latin1,
         "Number,Description\n1,Gr\xF6\xDF"
         "e \xA4\n",
         "number=1 description=Größe ¤", "Latin-1"},
        {TextEncoding::Latin1, "Number,Description\n1,\x80\xFF\n", "number=1 description=\xC2\x80ÿ",
         "every byte is a character"},
        {TextEncoding::Windows1252,
         "Number,Description\n1,Gr\xF6\xDF"
         "e \x80\x92\xFF\n",
         "number=1 description=Größe €’ÿ", "Windows-1252"},
        {TextEncoding::Utf16, utf16(QStringLiteral("Number\n"), false), "", "a header row alone"},
        {TextEncoding::Utf16, utf16(QString(), true), "error 1:1 a header row of variable names was expected",
         "a mark alone"},
        {TextEncoding::Utf16, text.toUtf8(),
         "error 1:1 the file has no byte-order mark: UTF-16 with its mark was expected", "no mark"},
        {TextEncoding::Utf16, "", "error 1:1 the file has no byte-order mark: UTF-16 with its mark was expected",
         "nothing"},
        {TextEncoding::Utf16, utf16(QStringLiteral("Number\nab"), false).chopped(1), "error 2:2 the file is not UTF-16",
         "half a character"},
        {TextEncoding::Utf16, utf16(QStringLiteral("Number\n𝄞").chopped(1), true), "error 2:1 the file is not UTF-16",
         "half a pair at the end"},
        {TextEncoding::Utf16, utf16(QStringLiteral("Number\n𝄞").chopped(1) + u'x', true),
         "error 2:1 the file is not UTF-16", "half a pair"},
        {TextEncoding::Utf16, utf16(QStringLiteral("Number\n1") + QChar(0xDD1E), true),
         "error 2:2 the file is not UTF-16", "the other half"},
        {TextEncoding::Windows1252, "Number\n1\x81\n",
         "error 2:2 the file is not Windows-1252: it contains a byte that this encoding does not use",
         "a byte without a character"},
        {TextEncoding::Latin1, "Number,Count\n\xF6,x\n",
         "error 2:3 the cell \"x\" of the column \"Count\" does not fit: a whole number was expected",
         "places count characters"},
        {TextEncoding::Utf8, "Number\n\xF6\n", "error 2:1 the file is not UTF-8", "Latin-1 that was not announced"},
    };
    for (const Row &row : rows) {
        CsvDialect dialect;
        dialect.encoding = row.encoding;
        EXPECT_EQ(survey::rowsOf(row.bytes, dialect).join(u'|').toStdString(), row.expected) << row.reason;
    }
}

TEST(TextEncoding, ALargeFileIsTheSame)
{
    QString text = QStringLiteral("Number,Description\n");
    for (int i = 0; i < 60000; ++i) {
        text += QStringLiteral("%1,Größe der Straße\n").arg(i);
    }
    CsvDialect latin;
    latin.encoding = TextEncoding::Latin1;
    CsvDialect wide;
    wide.encoding = TextEncoding::Utf16;
    const QStringList expected = survey::rowsOf(text.toUtf8(), CsvDialect());
    ASSERT_EQ(expected.size(), 60000);
    EXPECT_EQ(survey::rowsOf(text.toLatin1(), latin), expected);
    EXPECT_EQ(survey::rowsOf(utf16(text, true), wide), expected);
}

} // namespace

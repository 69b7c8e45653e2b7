#include "EditableText.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

namespace
{

using kareport::EditableText;

TEST(EditableText, WhatWasNotEditedHasItsBytesAgain)
{
    const QByteArray files[] = {"",
                                "\n",
                                "one",
                                "one\ntwo\n",
                                "one\r\ntwo\r\n",
                                "one\r\ntwo\nthree\rfour",
                                "\xEF\xBB\xBFone\r\n\r\n",
                                "\xEF\xBB\xBF",
                                "caf\xE9\r\nna\xEFve",
                                "caf\xC3\xA9\n",
                                "\n\n\r\n\r",
                                "tab\there \n"};
    for (const QByteArray &bytes : files) {
        const EditableText file(bytes);
        EXPECT_EQ(file.bytesOf(file.text()), bytes);
        EXPECT_FALSE(file.text().contains(u'\r'));
        EXPECT_FALSE(file.changesEncoding(file.text()));
    }
}

TEST(EditableText, LineEndsStayWithTheirLines)
{
    struct Row
    {
        QByteArray before;
        const char *text;
        QByteArray after;
    };
    const Row rows[] = {
        {"a\r\nb\nc\r\n", "a\nnew\nb\nc\n", "a\r\nnew\r\nb\nc\r\n"},
        {"a\r\nb\nc\r\n", "b\nc\n", "b\nc\r\n"},
        {"a\r\nb\nc\r\nd\n", "a\nB\nc\nx\nd\n", "a\r\nB\r\nc\r\nx\r\nd\n"},
        {"a\nb", "a\nb\n", "a\nb\n"},
        {"a\r\nb", "a\nb\nc", "a\r\nb\r\nc"},
        {"a\r\nb\r\n", "", ""},
        {"", "x\ny", "x\ny"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(EditableText(row.before).bytesOf(QString::fromLatin1(row.text)), row.after) << row.text;
    }
}

TEST(EditableText, LatinTextStaysSoAsLongAsItCan)
{
    const EditableText file("caf\xE9");
    EXPECT_EQ(file.bytesOf(QStringLiteral("café au lait")), QByteArray("caf\xE9 au lait"));
    EXPECT_EQ(file.bytesOf(QStringLiteral("cafe")), "cafe");
    EXPECT_TRUE(file.changesEncoding(QStringLiteral("café €")));
    EXPECT_EQ(file.bytesOf(QStringLiteral("café €")), QStringLiteral("café €").toUtf8());
    const QString looksLikeUtf8 = QStringLiteral("\u00C3\u00A9"); // its bytes would be read as another text
    EXPECT_TRUE(file.changesEncoding(looksLikeUtf8));
    EXPECT_EQ(file.bytesOf(looksLikeUtf8), looksLikeUtf8.toUtf8());
}

} // namespace

#include "RichTextDescription.h"
#include "RichTextWriter.h"

#include <QBuffer>
#include <QFile>
#include <QProcess>
#include <QStandardPaths>
#include <QTemporaryDir>
#include <QTextCursor>
#include <QUrl>

namespace
{

/// Lets a word processor of other people read and write what we write.
class RichTextOffice : public testing::Test
{
protected:
    void SetUp() override
    {
        office_ = QStandardPaths::findExecutable(QStringLiteral("soffice"));
        if (office_.isEmpty()) {
            GTEST_SKIP() << "no soffice is installed, which would read what is written";
        }
        ASSERT_TRUE(folder_.isValid());
    }

    QByteArray convert(const QByteArray &bytes, const QString &format)
    {
        const QString name = folder_.filePath(QStringLiteral("in.rtf"));
        QFile file(name);
        EXPECT_TRUE(file.open(QIODevice::WriteOnly) && file.write(bytes) == bytes.size());
        file.close();
        const QString out = folder_.filePath(QStringLiteral("out"));
        const QString profile = QUrl::fromLocalFile(folder_.filePath(QStringLiteral("profile"))).toString();
        QProcess process;
        process.setProcessChannelMode(QProcess::MergedChannels);
        process.start(office_, {QStringLiteral("-env:UserInstallation=") + profile, QStringLiteral("--headless"),
                                QStringLiteral("--convert-to"), format, QStringLiteral("--outdir"), out, name});
        EXPECT_TRUE(process.waitForFinished(100'000)) << process.readAll().constData();
        QFile result(out + QStringLiteral("/in.") + format.section(u':', 0, 0));
        EXPECT_TRUE(result.open(QIODevice::ReadOnly)) << process.readAll().constData();
        return result.readAll();
    }

private:
    QString office_;
    QTemporaryDir folder_;
};

QTextCharFormat plain()
{
    QTextCharFormat format;
    format.setFontFamilies({QStringLiteral("DejaVu Sans Mono")});
    format.setFontPointSize(9);
    return format;
}

void fill(QTextDocument &document)
{
    QTextCursor cursor(&document);
    cursor.insertText(QStringLiteral("Point 1\t12°34' {a}\\b € 測量 😀\n\nline\u2028"
                                     "line "),
                      plain());
    QTextCharFormat format = plain();
    format.setFontWeight(QFont::Bold);
    format.setFontUnderline(true);
    cursor.insertText(QStringLiteral("bold"), format);
    format = plain();
    format.setForeground(QColor(255, 0, 0));
    format.setFontItalic(true);
    format.setFontPointSize(14);
    cursor.insertText(QStringLiteral("red"), format);
    QTextBlockFormat right;
    right.setAlignment(Qt::AlignRight);
    right.setPageBreakPolicy(QTextFormat::PageBreak_AlwaysBefore);
    cursor.insertBlock(right, plain());
    cursor.insertText(QStringLiteral("the end"), plain());
}

QByteArray written()
{
    QTextDocument document;
    fill(document);
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    EXPECT_TRUE(kareport::writeRichText(buffer, document));
    return buffer.data();
}

TEST_F(RichTextOffice, ReadsTheTextThatIsWritten)
{
    QString text = QString::fromUtf8(convert(written(), QStringLiteral("txt:Text (encoded):UTF8")));
    text.remove(QChar(QChar::ByteOrderMark)).remove(u'\r');
    EXPECT_EQ(text.trimmed(), QStringLiteral("Point 1\t12°34' {a}\\b € 測量 😀\n\nline\nline boldred\nthe end"));
}

TEST_F(RichTextOffice, WhatItWritesIsRead)
{
    QTextDocument expected;
    fill(expected);
    QTextDocument read;
    const QByteArray bytes = convert(written(), QStringLiteral("rtf"));
    const auto error = kareport::readRichText(QByteArrayView(bytes), read);
    ASSERT_FALSE(error) << error->text.toStdString();
    EXPECT_EQ(read.toRawText(), expected.toRawText());

    const auto formatOf = [&read](const char *word) {
        return read.find(QString::fromLatin1(word), 0, QTextDocument::FindCaseSensitively).charFormat();
    };
    EXPECT_EQ(formatOf("Point").fontFamilies().toStringList().value(0), QStringLiteral("DejaVu Sans Mono"));
    EXPECT_EQ(formatOf("Point").fontPointSize(), 9);
    EXPECT_LT(formatOf("Point").fontWeight(), QFont::DemiBold);
    EXPECT_EQ(formatOf("bold").fontWeight(), QFont::Bold);
    EXPECT_TRUE(formatOf("bold").fontUnderline());
    EXPECT_TRUE(formatOf("red").fontItalic());
    EXPECT_FALSE(formatOf("red").fontUnderline());
    EXPECT_EQ(formatOf("red").fontPointSize(), 14);
    EXPECT_EQ(formatOf("red").foreground().color(), QColor(255, 0, 0));
    EXPECT_EQ(read.lastBlock().blockFormat().alignment(), Qt::AlignRight);
    EXPECT_EQ(read.lastBlock().blockFormat().pageBreakPolicy(), QTextFormat::PageBreak_AlwaysBefore);
    EXPECT_EQ(read.firstBlock().blockFormat().pageBreakPolicy(), QTextFormat::PageBreak_Auto);
}

} // namespace

#include "KeptDocument.h"

#include "PdfFixture.h"

#include <hpdf_fontdef.h>

#include <gtest/gtest.h>

#include <iterator>
#include <vector>

namespace
{

using kareport::KeptDocument;
using kareport::KeptDocuments;
using kareport::PdfFace;

void countError(HPDF_STATUS /*error*/, HPDF_STATUS /*detail*/, void *count)
{
    ++*static_cast<int *>(count);
}

/// A font file whose face has the name of another one, and is not the same: its lines are higher.
QByteArray higherFace()
{
    QFile file(dejaVuFile());
    EXPECT_TRUE(file.open(QIODevice::ReadOnly));
    QByteArray bytes = file.readAll();
    const auto number = [&bytes](qsizetype at) {
        quint32 value = 0;
        for (qsizetype i = at; i < at + 4; ++i) {
            value = value << 8 | static_cast<quint8>(bytes[i]);
        }
        return static_cast<qsizetype>(value);
    };
    const qsizetype entry = bytes.indexOf("hhea");
    EXPECT_GT(entry, 0);
    const qsizetype ascender = number(entry + 8) + 4;
    bytes[ascender] = static_cast<char>(bytes[ascender] + 1);
    return bytes;
}

/// What a process without anything kept writes.
QByteArray freshPdf(const QString &text, const kareport::PdfOptions &options = pdfOptions())
{
    KeptDocuments::ofProcess().clear();
    return pdfBytes(text, options);
}

TEST(KeptDocument, WhatWasReadForOnePdfChangesNoByteOfAnother)
{
    // The faces of Latin, of Japanese, and of both, one after the other in any order.
    const QString texts[] = {QStringLiteral("plain text\r\n"), QStringLiteral("測量\r\n"),
                             QStringLiteral("∞ 測 \u2603 Ångström\r\n"), QStringLiteral("ΑΒΓ é\r\n")};
    std::vector<QByteArray> fresh;
    for (const QString &text : texts) {
        fresh.push_back(freshPdf(text));
    }
    for (std::size_t turn = 0; turn < 16; ++turn) {
        const std::size_t at = (turn * 7 + turn / 4) % std::size(texts);
        EXPECT_TRUE(pdfBytes(texts[at]) == fresh[at]) << turn << ": " << texts[at].toStdString();
    }
}

TEST(KeptDocument, WhatOnePdfSaysOfItselfIsNotInTheNext)
{
    const QString text = QStringLiteral("plain text\r\n");
    const QByteArray fresh = freshPdf(text);
    kareport::PdfDetails details;
    details.title = QStringLiteral("Setting out");
    details.language = QStringLiteral("en"); // which needs a later version of PDF
    kareport::PdfOptions described = pdfOptions();
    described.details = &details;
    described.outline = {{0, QStringLiteral("A"), 0}};
    const QByteArray freshDescribed = freshPdf(text, described);
    EXPECT_TRUE(pdfBytes(text) == fresh);
    EXPECT_TRUE(pdfBytes(text, described) == freshDescribed);
    EXPECT_FALSE(fresh == freshDescribed);
}

TEST(KeptDocument, AFaceOfTheSameNameInAnotherFileIsReadItself)
{
    const QString text = QStringLiteral("plain text\r\n");
    FontFolder folder;
    folder.withText(QStringLiteral("lucon.TTF"), higherFace());
    kareport::PdfOptions options = pdfOptions();
    options.fontFolders = QStringList{folder.path()};
    const QByteArray plain = freshPdf(text);
    const QByteArray higher = freshPdf(text, options);
    ASSERT_FALSE(plain == higher);
    for (int turn = 0; turn < 3; ++turn) {
        EXPECT_TRUE(pdfBytes(text) == plain) << turn;
        EXPECT_TRUE(pdfBytes(text, options) == higher) << turn;
    }
}

TEST(KeptDocument, AFileThatWasChangedIsReadAgain)
{
    const QString text = QStringLiteral("plain text\r\n");
    FontFolder folder;
    folder.with(QStringLiteral("lucon.TTF"), dejaVuFile());
    kareport::PdfOptions options = pdfOptions();
    options.fontFolders = QStringList{folder.path()};
    const QByteArray before = freshPdf(text, options);
    QFile file(folder.path() + QStringLiteral("/lucon.TTF"));
    ASSERT_TRUE(file.open(QIODevice::WriteOnly));
    file.write(higherFace());
    ASSERT_TRUE(file.flush());
    ASSERT_TRUE(file.setFileTime(QDateTime::currentDateTime().addSecs(10), QFileDevice::FileModificationTime));
    file.close();
    const QByteArray after = pdfBytes(text, options);
    EXPECT_FALSE(after == before);
    EXPECT_TRUE(after == freshPdf(text, options));
}

TEST(KeptDocument, ReadsAFaceOnce)
{
    int errors = 0;
    FontFolder folder;
    folder.withText(QStringLiteral("other.ttf"), higherFace());
    const PdfFace face(dejaVuFile(), 0, false);
    const PdfFace other(folder.path() + QStringLiteral("/other.ttf"), 0, false);
    KeptDocument document;
    document.begin(&countError, &errors);
    const HPDF_FontDef read = document.definitionOf(face);
    ASSERT_NE(read, nullptr);
    EXPECT_EQ(document.definitionOf(face), read);
    EXPECT_EQ(document.definitionOf(other), read) << "a PDF has one face of a name";
    document.end();
    document.begin(&countError, &errors);
    const HPDF_FontDef second = document.definitionOf(other);
    EXPECT_NE(second, read) << "another one begins with the other file";
    EXPECT_EQ(document.definitionOf(face), second);
    document.end();
    document.begin(&countError, &errors);
    EXPECT_EQ(document.definitionOf(face), read);
    EXPECT_EQ(errors, 0);
}

TEST(KeptDocument, WithManyFacesIsNotKept)
{
    int errors = 0;
    FontFolder folder;
    auto document = std::make_unique<KeptDocument>();
    for (std::size_t i = 0; i <= KeptDocument::mostFaces; ++i) {
        EXPECT_TRUE(document->isSmall()) << i;
        const QString name = QString::number(i) + QStringLiteral(".ttf");
        folder.with(name, dejaVuFile());
        document->begin(&countError, &errors);
        EXPECT_NE(document->definitionOf(PdfFace(folder.path() + u'/' + name, 0, false)), nullptr);
        document->end();
    }
    EXPECT_FALSE(document->isSmall());
    EXPECT_EQ(errors, 0);
    KeptDocuments documents;
    documents.keep(std::move(document));
    EXPECT_EQ(documents.take()->document(), nullptr) << "a new one";
}

TEST(KeptDocument, WhatFailedIsNotKept)
{
    const QString text = QStringLiteral("plain text\r\n");
    const QByteArray fresh = freshPdf(text);
    FontFolder folder;
    folder.withText(QStringLiteral("lucon.TTF"), "no font");
    kareport::PdfOptions options = pdfOptions();
    options.fontFolders = QStringList{folder.path()};
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    EXPECT_FALSE(kareport::writePdf(buffer, text, options));
    EXPECT_EQ(KeptDocuments::ofProcess().take()->document(), nullptr);
    EXPECT_TRUE(pdfBytes(text) == fresh);
}

} // namespace

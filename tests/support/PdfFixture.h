#pragma once

#include "PdfExport.h"
#include "PdfReadBack.h"
#include "PrintQt.h"

#include <QBuffer>
#include <QDir>
#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

/// Where faces come from in these tests.
inline QString dejaVuFile()
{
    return QStringLiteral("/usr/share/fonts/truetype/dejavu/DejaVuSansMono.ttf");
}

inline QString zenHeiFile()
{
    for (const kareport::PdfFace &face : kareport::fixedPitchPdfFaces()) {
        if (face.file().endsWith(u"zenhei.ttc")) {
            return face.file();
        }
    }
    ADD_FAILURE() << "the package fonts-wqy-zenhei is missing";
    return {};
}

/// A folder of fonts.
class FontFolder
{
public:
    QString path() const { return folder_.path(); }
    /// Puts a copy of a font file in, under another name.
    FontFolder &with(const QString &name, const QString &font)
    {
        EXPECT_TRUE(QFile::copy(font, folder_.filePath(name)));
        return *this;
    }
    /// Puts a file in that is no font.
    FontFolder &withText(const QString &name, const QByteArray &text)
    {
        QFile file(folder_.filePath(name));
        EXPECT_TRUE(file.open(QIODevice::WriteOnly));
        EXPECT_EQ(file.write(text), text.size());
        return *this;
    }

private:
    QTemporaryDir folder_;
};

/// A4 at 600 dpi with margins of half an inch, 60 lines of 9 points a page, and no preferred face.
inline kareport::PdfOptions pdfOptions()
{
    kareport::PdfOptions options;
    options.page.pageSize = QSize(4961, 7016);
    options.page.resolution = 600;
    options.page.margins = QMargins(1270, 1270, 1270, 1270);
    options.page.fontSize = 9;
    options.page.linesPerPage = 60;
    options.fontFolders = QStringList();
    return options;
}

/// A text whose lines end with LF, as a report ends them.
inline QString pdfLines(QString text)
{
    return text.replace(u'\n', QStringLiteral("\r\n"));
}

/// Writes a PDF that must come out well.
inline QByteArray pdfBytes(QStringView text, const kareport::PdfOptions &options, kareport::PdfNotes *notes = nullptr)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    kareport::PdfNotes own;
    EXPECT_TRUE(kareport::writePdf(buffer, text, options, notes != nullptr ? notes : &own))
        << own.problem.toStdString();
    return buffer.data();
}

inline QByteArray pdfBytes(const QString &text)
{
    return pdfBytes(text, pdfOptions());
}

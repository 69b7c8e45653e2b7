#include "PdfFixture.h"

#include "PdfFaces.h"

QString dejaVuFile()
{
    return QStringLiteral("/usr/share/fonts/truetype/dejavu/DejaVuSansMono.ttf");
}

QString zenHeiFile()
{
    for (const kareport::PdfFace &face : kareport::fixedPitchPdfFaces()) {
        if (face.file().endsWith(u"zenhei.ttc")) {
            return face.file();
        }
    }
    ADD_FAILURE() << "the package fonts-wqy-zenhei is missing";
    return {};
}

FontFolder &FontFolder::with(const QString &name, const QString &font)
{
    EXPECT_TRUE(QFile::copy(font, folder_.filePath(name)));
    return *this;
}

FontFolder &FontFolder::withText(const QString &name, const QByteArray &text)
{
    QFile file(folder_.filePath(name));
    EXPECT_TRUE(file.open(QIODevice::WriteOnly));
    EXPECT_EQ(file.write(text), text.size());
    return *this;
}

kareport::PdfOptions pdfOptions()
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

QString pdfLines(QString text)
{
    return text.replace(u'\n', QStringLiteral("\r\n"));
}

QByteArray pdfBytes(QStringView text, const kareport::PdfOptions &options, kareport::PdfNotes *notes)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    kareport::PdfNotes own;
    EXPECT_TRUE(kareport::writePdf(buffer, text, options, notes != nullptr ? notes : &own))
        << own.problem.toStdString();
    return buffer.data();
}

QByteArray pdfBytes(const QString &text)
{
    return pdfBytes(text, pdfOptions());
}

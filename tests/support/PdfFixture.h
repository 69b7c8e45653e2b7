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
QString dejaVuFile();

QString zenHeiFile();

/// A folder of fonts.
class FontFolder
{
public:
    QString path() const { return folder_.path(); }
    /// Puts a copy of a font file in, under another name.
    FontFolder &with(const QString &name, const QString &font);
    /// Puts a file in that is not a font.
    FontFolder &withText(const QString &name, const QByteArray &text);

private:
    QTemporaryDir folder_;
};

/// A4 at 600 dpi with margins of half an inch, 60 lines of 9 points a page, and no preferred face.
kareport::PdfOptions pdfOptions();

/// A text whose lines end with LF, as a report ends them.
QString pdfLines(QString text);

/// Writes a PDF that must come out well.
QByteArray pdfBytes(QStringView text, const kareport::PdfOptions &options, kareport::PdfNotes *notes = nullptr);

QByteArray pdfBytes(const QString &text);

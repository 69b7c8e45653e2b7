#pragma once

#include <QByteArray>
#include <QImage>
#include <QJsonObject>
#include <QRect>
#include <QString>
#include <QStringList>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <vector>

// PDFs read back with other people's tools.

/// A word of a page and where it is, in points from the sheet's upper left corner.
struct PdfWord
{
    QString text;
    double left = 0;
    double top = 0;
    double right = 0;
    double bottom = 0;
};

/// An embedded face, as it is listed.
struct PdfFont
{
    QString name;
    QString type;
    bool isEmbedded = false;
    bool isSubset = false;
    bool hasTextMap = false;
};

/// A PDF in a folder of its own.
class PdfReadBack
{
public:
    /// @param remark  that readers make about it on standard error
    explicit PdfReadBack(const QByteArray &bytes, const char *remark = "");

    /// The text of every page, as it is laid out; empty lines do not count.
    QStringList pages() const { return textOfPages({QStringLiteral("-layout")}); }

    /// The text of every page in columns of so many points, without the margin: blanks and empty lines included.
    QStringList columns(double pointsPerCharacter) const;

    /// All that is written on all pages, in the order of writing, without blanks and line ends.
    QString characters() const;

    /// What a reader says of the document, such as its "Title"; empty when it says nothing.
    QString info(const char *entry) const;
    /// The outline with an entry a line, two blanks before it for each that it belongs to, and after it the number of its page.
    /// An entry whose own are not shown at first ends with "…".
    QString outline() const;
    /// The texts of the outline, in their order, as a viewer reads them.
    QStringList outlineTexts() const;
    /// The names of all pages, as viewers show them.
    QStringList labels() const;

    int pageCount() const { return info("Pages").toInt(); }
    /// Of the first page, as "612 x 792 pts (letter)".
    QString pageSize() const { return info("Page size"); }

    std::vector<PdfFont> fonts() const;

    /// The words of a page, from 1.
    std::vector<PdfWord> words(int page = 1) const;

    /// Checks the file's structure. @return what is wrong; empty when nothing is
    QString check() const;

    /// The objects and streams of the file, uncompressed.
    QByteArray objects() const;

    /// A page, from 1, in grey.
    QImage picture(int page = 1, int dotsPerInch = 100) const;

private:
    QStringList textOfPages(const QStringList &options) const;

    QByteArray run(const char *program, const QStringList &arguments) const;
    QJsonObject json(const char *key) const;

    QTemporaryDir folder_;
    QString path_;
    QByteArray remark_;
};

/// The part of a picture that is not white, and how much black there is in it (in whole dots).
struct Ink
{
    QRect box;
    double amount = 0;
};

Ink inkIn(const QImage &image, const QRect &area);

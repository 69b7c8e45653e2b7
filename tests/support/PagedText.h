#pragma once

#include "LinePager.h"

#include <QImage>
#include <QPainter>
#include <QPlainTextDocumentLayout>
#include <QPrinter>
#include <QTemporaryDir>
#include <QTextDocument>

#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <vector>

/// A text of the fixed-pitch face of 8 points on a printer of 600 dots per inch, which prints into a file: a line is 78
/// dots high and a character 40 dots wide.
class PagedText
{
public:
    explicit PagedText(const QString &text = QString());

    QTextDocument &document() { return *document_; }
    QPrinter &printer() { return printer_; }
    QString file() const { return folder_.filePath(QStringLiteral("pages.pdf")); }
    kareport::LinePager pager() { return {*document_, printer_}; }

    /// A rectangle that takes so many lines and characters, at the place of the usual margins.
    static QRect room(int lines, int characters);
    /// Where the pages of the text begin.
    std::vector<qint64> starts(const QRect &page);

private:
    QTemporaryDir folder_;
    std::unique_ptr<QTextDocument> document_;
    QPrinter printer_{QPrinter::HighResolution};
};

/// Lines of four characters and their end.
QString shortLines(int count);

/// The dots of the upper left of a sheet on a printer of 600 dots per inch, with what a painter draws on it.
QImage sheetImage(const QSize &size, const std::function<void(QPainter &)> &draw);

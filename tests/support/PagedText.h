#pragma once

#include "LinePager.h"

#include <QPainter>
#include <QPlainTextDocumentLayout>
#include <QPrinter>
#include <QTemporaryDir>
#include <QTextDocument>

#include <gtest/gtest.h>

#include <memory>
#include <vector>

/// A text of the fixed-pitch face of 8 points on a printer of 600 dots per inch, which prints into a file: a line is 78
/// dots high and a character 40 dots wide.
class PagedText
{
public:
    explicit PagedText(const QString &text = QString()) : document_(new QTextDocument)
    {
        document_->setDocumentLayout(new QPlainTextDocumentLayout(document_.get()));
        QFont font;
        font.setFamilies({QStringLiteral("DejaVu Sans Mono")});
        font.setFixedPitch(true);
        font.setPointSize(8);
        document_->setDefaultFont(font);
        document_->setPlainText(text);
        printer_.setOutputFormat(QPrinter::PdfFormat);
        printer_.setOutputFileName(file());
        printer_.setResolution(600);
        printer_.setPageSize(QPageSize(QPageSize::A4));
        printer_.setFullPage(true);
    }

    QTextDocument &document() { return *document_; }
    QPrinter &printer() { return printer_; }
    QString file() const { return folder_.filePath(QStringLiteral("pages.pdf")); }
    kareport::LinePager pager() { return {*document_, printer_}; }

    /// A rectangle that takes so many lines and characters, at the place of the usual margins.
    static QRect room(int lines, int characters)
    {
        return {567, 567, (characters * 40 + 5) * 1440 / 600, (lines * 78 + 5) * 1440 / 600};
    }
    /// Where the pages of the text begin.
    std::vector<qint64> starts(const QRect &page)
    {
        std::vector<qint64> found = {0};
        kareport::LinePager pages = pager();
        for (;;) {
            const qint64 next = pages.layOut(page, found.back(), -1);
            if (next >= pages.length() || next <= found.back()) {
                return found;
            }
            found.push_back(next);
        }
    }

private:
    QTemporaryDir folder_;
    std::unique_ptr<QTextDocument> document_;
    QPrinter printer_{QPrinter::HighResolution};
};

/// Lines of four characters and their end.
inline QString shortLines(int count)
{
    return QStringLiteral("line\n").repeated(count);
}

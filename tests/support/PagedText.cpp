#include "PagedText.h"

PagedText::PagedText(const QString &text) : document_(new QTextDocument)
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

QRect PagedText::room(int lines, int characters)
{
    return {567, 567, (characters * 40 + 5) * 1440 / 600, (lines * 78 + 5) * 1440 / 600};
}

std::vector<qint64> PagedText::starts(const QRect &page)
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

QString shortLines(int count)
{
    return QStringLiteral("line\n").repeated(count);
}

QImage sheetImage(const QSize &size, const std::function<void(QPainter &)> &draw)
{
    constexpr int dotsPerMetre = 23622;
    QImage image(size, QImage::Format_Grayscale8);
    image.setDotsPerMeterX(dotsPerMetre);
    image.setDotsPerMeterY(dotsPerMetre);
    image.fill(Qt::white);
    QPainter painter(&image);
    draw(painter);
    painter.end();
    return image;
}

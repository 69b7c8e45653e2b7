#include "NumberedPages.h"

NumberedPages::NumberedPages(int count) : count_(count)
{
    source.expectedPages = count;
    source.begin = [this](QPainter &) { ++begun; };
    source.end = [this](QPainter &) { ++ended; };
    source.find = [this](QPainter &, int page) { return page <= count_; };
    source.print = [this](QPainter &painter, int page) {
        printed.push_back(page);
        painter.drawText(500, 500, QStringLiteral("Page %1").arg(page));
        if (delay > 0) {
            QElapsedTimer timer;
            timer.start();
            while (timer.elapsed() < delay) {
            }
        }
        return page < count_;
    };
    source.isUnchanged = [this] { return unchanged; };
}

int pagesIn(const QString &pdf)
{
    QProcess process;
    process.start(QStringLiteral("pdfinfo"), {pdf});
    process.waitForFinished();
    for (const QByteArray &line : process.readAllStandardOutput().split('\n')) {
        if (line.startsWith("Pages:")) {
            return line.mid(6).trimmed().toInt();
        }
    }
    return -1;
}

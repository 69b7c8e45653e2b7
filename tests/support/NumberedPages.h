#pragma once

#include "PrintJob.h"

#include <QElapsedTimer>
#include <QPainter>
#include <QProcess>
#include <QString>

#include <vector>

/// Prints the number of each page on it, and keeps what was asked for.
class NumberedPages
{
public:
    explicit NumberedPages(int count) : count_(count)
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

    kareport::PrintSource source;
    std::vector<int> printed;
    int begun = 0;
    int ended = 0;
    int delay = 0; ///< milliseconds a page
    bool unchanged = true;

private:
    int count_;
};

/// The pages of a PDF, as somebody else counts them; -1 where there is none.
inline int pagesIn(const QString &pdf)
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

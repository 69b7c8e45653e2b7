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
    explicit NumberedPages(int count);

    kareport::PrintSource source;
    std::vector<int> printed;
    int begun = 0;
    int ended = 0;
    int delay = 0; ///< milliseconds a page
    bool unchanged = true;

private:
    int count_;
};

/// The pages of a PDF, as another program counts them; -1 where there is none.
int pagesIn(const QString &pdf);

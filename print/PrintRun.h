#pragma once

#include "LinePager.h"
#include "PrintSheets.h"

#include <QPaintDevice>
#include <QPointer>
#include <QRect>
#include <QSize>
#include <QTextDocument>

#include <vector>

namespace kareport
{

/// What is computed once for all sheets of a job.
struct PrintRun
{
    PrintRun(QTextDocument &text, QPaintDevice &device)
        : document(&text),
          revision(text.revision()),
          resolution(device.logicalDpiX(), device.logicalDpiY()),
          pager(text, device)
    {}

    /// Whether it is about this text as it is now, on this device as it is set up.
    bool isFor(const QTextDocument &text, const QPaintDevice &device) const
    {
        return document == &text && revision == text.revision() && &pager.device() == &device &&
               resolution == QSize(device.logicalDpiX(), device.logicalDpiY());
    }

    QPointer<QTextDocument> document;
    int revision;
    QSize resolution; ///< of the device
    QRect room;       ///< of the sheets, in twips
    LinePager pager;
    std::vector<PrintSheet> sheets; ///< empty where the lines flow from sheet to sheet
};

} // namespace kareport

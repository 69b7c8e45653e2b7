#pragma once

#include "PageLayout.h"
#include "PageWriter.h"
#include "ReportAccess.h"
#include "ReportSurroundings.h"
#include "ReportTemplate.h"
#include "TextMirrors.h"

#include <QString>

#include <optional>

class UDocument;

namespace kareport
{

/// What a report document is made of. The parts do the work and know nothing of `UReportDoc`, which joins them; what is
/// here by itself are the settings that its own functions read and write.
struct ReportParts
{
    explicit ReportParts(UDocument &document) : mirrors(document), page(&mirrors) {}

    /// What the page is measured on; nothing without a printer.
    std::optional<PageDevice> pageDevice() const
    {
        return surroundings ? kareport::pageDevice(surroundings->printer, surroundings->isPortrait)
                            : reportPageDevice();
    }

    std::optional<ReportSurroundings> surroundings; ///< nothing while those of the program apply
    ReportHooks hooks;

    // Text and pages
    TextMirrors mirrors;
    PageWriter page;
    PageLayout layout;
    quint64 editCount = 0;

    // Templates and data
    ReportTemplate data;
    bool writeTableName = false;
    QString chainageLabel;

    // Title and external editor
    QString title;
    QString reportFileName;
    bool externalEditor = false;
    bool optionExcel = false;

    // Files
    QString saveProblem;
    bool openedFromRtf = false;
    bool openedWithoutMemory = false; ///< the last opening, or loading, found no memory for what it opens
    bool isSerializing = false;

    // The host's object whose text this is
    void *textObject = nullptr;
    unsigned textObjectId = 0;

    // Closing
    UDocument *owner = nullptr;
    int canClose = 1;
    int closeMode = 0;
    bool closeDocument = false;
    bool closeOptionEnabled = true;
};

} // namespace kareport

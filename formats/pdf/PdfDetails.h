#pragma once

#include <QDateTime>
#include <QString>

namespace kareport
{

/// What a PDF says of itself besides its pages. An empty text, or a time that is not valid, is left out.
struct PdfDetails
{
    QString title;             ///< of the document
    QString author;            ///< who answers for it
    QString creator;           ///< the program that the report was made with
    QDateTime created;         ///< as the hands of a clock show it: its zone is not said
    QString language;          ///< of the report's texts, as "de" or "en-GB"
    bool hasOutline = true;    ///< with an entry for each heading, table and group
    bool hasPageLabels = true; ///< the numbers of the report's pages, for the viewer to show and to go to
};

} // namespace kareport

#pragma once

#include "PdfDetails.h"
#include "ResultOptions.h"

#include <QString>

#include <memory>
#include <optional>

namespace kareport
{

/// What a report is written as.
enum class OutputKind
{
    Report,   ///< a report file
    Text,     ///< plain text, UTF-8
    RichText, ///< rich text as the report's view saves it
    Pdf,
    RichTextImage, ///< the rich text that is handed to a word processor
    Html,          ///< a web page
    Xlsx,          ///< a workbook
    Csv,           ///< the rows of one table
    JsonLines,     ///< the same, an object for each row
    Schema         ///< what the columns of one of these are; it comes with such an output, and no name says it
};

/// The kind of a name such as "rep".
std::optional<OutputKind> outputKindFromName(const QString &name);
/// The kind that a file name's ending says, or `otherwise` where it says none. Standard output, "-", says none, and is
/// text without an `otherwise`. ".rtf" says rich text of either kind: the image is taken where `otherwise` is it.
std::optional<OutputKind> outputKindOf(const QString &file, std::optional<OutputKind> otherwise = std::nullopt);
/// Whether outputs of a kind are made of the typed results of a job's run, which a report that was saved does not have.
bool isMadeOfResults(OutputKind kind);
/// Whether they have the rows of one step alone.
bool isOfOneTable(OutputKind kind);
/// The names of all kinds, for messages.
QString outputKindNames();

/// Where a report goes.
struct Output
{
    QString file; ///< "-" for standard output
    OutputKind kind = OutputKind::Text;
    std::optional<qint64> mostBytes = std::nullopt;   ///< none when it may have any size
    std::shared_ptr<const PdfDetails> pdf = nullptr;  ///< what a PDF says of itself; null when it has its pages alone
    ResultOptions results = {};                       ///< of an output that is made of results
    std::optional<std::size_t> sideOf = std::nullopt; ///< the number of the output that it comes with

    bool isStandardOutput() const { return file == u"-"; }
};

} // namespace kareport

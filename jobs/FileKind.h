#pragma once

#include <QString>
#include <QStringView>

#include <optional>

namespace kareport
{

/// What a file is that a user opens.
enum class FileKind
{
    Job,
    Template,
    Pdf,
    RichText ///< or the text of a report: a report without a view is saved as its text also under this name
};

/// Whether a file name has an ending such as ".json", in any case. Where a report is saved, `isRichTextName` and
/// `isPdfName` decide instead.
bool hasEnding(QStringView name, QStringView ending);

/// The kind that the ending of a file name says; nothing where it says none, as that of a report file.
std::optional<FileKind> fileKindOf(QStringView name);

/// Whether a file is data that a report can be made of, by its name. LandXML is not told from a template so.
bool isDataName(QStringView name);

/// Whether a file is a job. Standard input, "-", is one. A file whose name does not tell is opened: a job begins with a
/// brace.
bool isJobFile(const QString &file);

/// Whether a file is a PDF: by the name that a report is saved as one under, or by its first bytes.
bool isPdfFile(const QString &path);

} // namespace kareport

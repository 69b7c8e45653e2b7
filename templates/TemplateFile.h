#pragma once

#include "KaReportExport.h"

#include <QByteArray>
#include <QByteArrayView>
#include <QString>

#include <optional>

namespace kareport
{

/// The text of a template file: UTF-8 when the whole file is valid UTF-8, else Latin-1. The file counts as read in
/// chunks of 4095 bytes, and a zero byte ends its chunk's text.
class KAREPORT_EXPORT TemplateFile
{
public:
    /// The text of the bytes of a file. @throws std::bad_alloc
    explicit TemplateFile(QByteArrayView bytes);

    /// Reads a file; nothing when it cannot be opened or read, or memory ends.
    static std::optional<TemplateFile> read(const QString &path);
    /// Reads a file's text as it is scanned, for code that does not report places in the file.
    static std::optional<QString> readScanned(const QString &path);

    /// The text as it is in the file.
    const QString &text() const { return text_; }

private:
    QString text_;
};

} // namespace kareport

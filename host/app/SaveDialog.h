#pragma once

#include "KaReportExport.h"

#include <QString>

#include <functional>
#include <optional>

class UDocument;

namespace kareport
{

/// What the user is asked when a document needs a file name.
struct SaveRequest
{
    static constexpr unsigned overwritePrompt = 0x0002; ///< ask before an existing file is taken
    static constexpr unsigned hideReadOnly = 0x0004;    ///< no box for "read only"
    static constexpr unsigned pathMustExist = 0x0800;   ///< only folders that exist

    QString defaultExtension; ///< for a name without one, without its dot
    QString fileName;         ///< that the dialog begins with
    QString initialFolder;    ///< empty for the host's own choice
    /// Pairs of a kind's title and its name pattern, each after a "|", ended by "||".
    QString filter;
    unsigned flags = 0;            ///< of those above
    UDocument *document = nullptr; ///< that is to be saved; may be null
};

/// Shows the dialog. @return the full path that was chosen, or nothing when it was cancelled
using SaveDialog = std::function<std::optional<QString>(const SaveRequest &request)>;

/// Says that a document could not be saved. @param reason  why, without a full stop; empty when it is not known
using SaveFailure = std::function<void(const QString &path, const QString &reason)>;

/// Installs what asks for names; an empty one cancels every question again.
KAREPORT_EXPORT void setSaveDialog(SaveDialog dialog);
/// Asks for a name through what is installed.
KAREPORT_EXPORT std::optional<QString> askSaveName(const SaveRequest &request);
/// Installs what says that a save under a name that was asked for has failed. Without it nothing is said: the document's
/// answer is all that its host gets.
KAREPORT_EXPORT void setSaveFailure(SaveFailure say);
/// Says it through what is installed.
KAREPORT_EXPORT void saySaveFailed(const QString &path, const QString &reason);

} // namespace kareport

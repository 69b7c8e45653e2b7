#pragma once

#include "SaveDialog.h"

#include <QString>
#include <QStringList>

#include <functional>
#include <optional>

class QWidget;

namespace kareport
{

/// What the user chose in a save dialog.
struct SaveChoice
{
    SaveChoice(const QString &chosen, bool outline = false) : path(chosen), hasOutline(outline) {}

    QString path;
    bool hasOutline; ///< of a PDF: it has title, outline and page labels
};

/// A question for the name of a report's file with a name to begin with, where it has none: see `proposedName`.
/// @param origin  the file that the report was made of; empty for none
SaveRequest withProposedName(const SaveRequest &request, const QString &origin);

/// Asks for the name of a file to save in. Its ending follows the kind that is chosen, and a file is only replaced when the
/// user says so. A report may become a PDF with an outline as well.
std::optional<SaveChoice> askSavePath(QWidget *parent, const SaveRequest &request);

/// Asks for the name of a file that becomes the report's own. A PDF can never be that, as it cannot be opened again: when
/// the user names one, the report is exported into it, and the answer is that of a cancelled dialog.
/// @param ask  asks for a name of any kind
std::optional<QString> askOwnName(const SaveRequest &request,
                                  const std::function<std::optional<SaveChoice>(const SaveRequest &)> &ask);

/// A typed name with the ending of a kind. An ending that names another kind stays.
/// @param kind, kinds  name patterns ("*.rep") of the kind that is chosen and of all kinds; "*" asks for no ending
QString withEndingOf(const QString &path, const QString &kind, const QStringList &kinds);

} // namespace kareport

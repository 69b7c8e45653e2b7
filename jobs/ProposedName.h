#pragma once

#include <QString>

namespace kareport
{

/// What is known of a report that is to be saved in a file.
struct NamedReport
{
    QString title;
    QString file;   ///< its own; empty for a report that has none
    QString origin; ///< the job or the data that it was made of; empty for none
    QString folder; ///< the one used last; empty for none
};

/// A text as the name of a file: without the characters that a file system takes for something else.
/// @return empty when nothing is left
QString fileNameOf(const QString &text);

/// The full name that a save dialog proposes for a report: its own name where it has a file, its title where it has none,
/// beside its own file, or beside what it was made of, unless that cannot be written to.
/// @param ending  such as "pdf"
QString proposedName(const NamedReport &report, const QString &ending);

/// A name whose ending is one of a list of name patterns ("*.rep"), with another ending. Any other name stays as it is.
QString withOtherEnding(const QString &name, const QString &pattern, const QStringList &patterns);

} // namespace kareport

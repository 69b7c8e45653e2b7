#pragma once

#include "TextPlaces.h"

#include <QString>
#include <QStringList>

class QWidget;

namespace kareport
{

/// Lines of a text file.
struct FileLines
{
    qsizetype first = 1;    ///< number of the first of them
    QStringList lines = {}; ///< each cut to a length that a window can show
    bool isWhole = false;   ///< whether the file ends with the last of them
};

/// Reads the lines of a file around one of them: no more than a window needs, however long the file is.
/// @return false when the file cannot be read, is not a file, or has no such line
bool readLinesAround(const QString &path, qsizetype line, FileLines &read);

/// Shows a place in a file, for reading: in the window of its templates where it is a template, else among the lines around
/// it, with their numbers. @return false when there is no such place
bool showFilePlace(QWidget *parent, const QString &path, const TextPlace &place);

} // namespace kareport

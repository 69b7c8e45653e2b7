#pragma once

#include "ColumnBinding.h"
#include "DataPreview.h"
#include "DataUnits.h"
#include "FileBytes.h"

#include <QJsonObject>
#include <QString>

#include <functional>
#include <memory>

namespace kareport
{

/// What a user who imports a file is offered before he has chosen anything.
struct ImportGuess
{
    QJsonObject options; ///< keys of a "csv" data set, as far as they are not the defaults
    QString shape; ///< the same for files with the same names of columns or, without a header row, with as many columns
};

/// The beginning of a text file, up to the end of a line: more than what is shown of it, and not more of a long file.
std::shared_ptr<const FileBytes> beginOfText(const std::shared_ptr<const FileBytes> &file);

/// Finds out how a text file of rows and cells is written: its encoding, its delimiter and its decimal sign, whether a header
/// row names the columns and, where none does, whether they are those of points.
/// @param variables  that are wanted
ImportGuess guessTextFile(const std::shared_ptr<const FileBytes> &begin, const Variables &variables);

/// The first rows of a text file, as a job with these keys reads them.
/// @param options  keys of a "csv" data set. What is wrong with them is the preview's error
DataPreview previewTextFile(const std::shared_ptr<const FileBytes> &begin, const QJsonObject &options,
                            const std::function<Variables(const DataUnits &)> &variablesIn, int mostRows);

} // namespace kareport

#pragma once

#include <QString>
#include <QStringList>

namespace kareport
{

/// Names for the sheets of a workbook, as spreadsheet programs take them: 1 to 31 characters, none of them one of : \ / ? * [ ],
/// no apostrophe at either end, not "History", and each only once without regard to case.
class SheetNames
{
public:
    /// A name for the next sheet: the wanted one, with what cannot be in it replaced by "_", cut where it is too long, and
    /// numbered where it is taken already.
    QString add(const QString &wanted);

private:
    QStringList taken_; ///< folded
};

} // namespace kareport

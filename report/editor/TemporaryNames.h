#pragma once

#include <QHashFunctions>
#include <QString>

#include <unordered_set>

namespace kareport
{

/// The stem of the temporary files of a report: its own name where it has no extension, what an extension has beyond three
/// letters where it is longer, else "Report$$$".
QString temporaryStem(const QString &reportFileName);

/// Names for temporary report files. Each is handed out once; what the file system holds is not looked at.
class TemporaryNames
{
public:
    /// The first name in a folder that has not been handed out: the stem, then the stem with a number from 2 on. When
    /// all up to 1000 have been, the last one is given again.
    QString next(const QString &folder, const QString &stem);

private:
    static constexpr int lastNumber = 1000;

    std::unordered_set<QString> handedOut_;
};

} // namespace kareport

#pragma once

#include "CsvObjectList.h"
#include "JobFolder.h"
#include "VariableType.h"

#include <QStringList>

#include <memory>

namespace csv
{

inline constexpr unsigned numberId = 1;
inline constexpr unsigned northingId = 2;
inline constexpr unsigned noteId = 6;
inline constexpr unsigned countId = 8;

/// A dictionary of four variables.
std::optional<kareport::ValueParser> findVariable(const QString &name);

/// A list that reads a file of its own.
class CsvFile
{
public:
    explicit CsvFile(const QByteArray &content, kareport::ReadProgress progress = {});
    QString path() const { return folder_.path("points.csv"); }

private:
    JobFolder folder_;

public:
    std::unique_ptr<kareport::CsvObjectList> list;
};

/// The values of an object as a text, "-" for a missing one.
QString textOf(const UDataObject *object);

} // namespace csv

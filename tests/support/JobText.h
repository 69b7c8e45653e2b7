#pragma once

#include "JobReader.h"

#include <QDir>

#include <gtest/gtest.h>

/// Jobs that are read from a text, as if it were in a file of the folder "jobs".
namespace jobtext
{

inline const QString folder = QDir::rootPath() + QStringLiteral("jobs");

kareport::JsonSource sourceOf(const QByteArray &json);

kareport::Job jobOf(const QByteArray &json);

} // namespace jobtext

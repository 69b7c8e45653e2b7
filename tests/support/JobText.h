#pragma once

#include "JobReader.h"

#include <QDir>

#include <gtest/gtest.h>

/// Jobs that are read from a text, as if it stood in a file of the folder "jobs".
namespace jobtext
{

inline const QString folder = QDir::rootPath() + QStringLiteral("jobs");

inline kareport::JsonSource sourceOf(const QByteArray &json)
{
    auto read = kareport::JsonSource::fromBytes(folder + QStringLiteral("/job.json"), json);
    EXPECT_EQ(kareport::errorOf(read), nullptr) << json.constData();
    return std::get<kareport::JsonSource>(std::move(read));
}

inline kareport::Job jobOf(const QByteArray &json)
{
    kareport::JsonSource source = sourceOf(json);
    kareport::Job job = readJob(source);
    EXPECT_FALSE(source.failed()) << source.error()->message().toStdString();
    return job;
}

} // namespace jobtext

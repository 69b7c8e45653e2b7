#include "JobText.h"

namespace jobtext
{

kareport::JsonSource sourceOf(const QByteArray &json)
{
    auto read = kareport::JsonSource::fromBytes(folder + QStringLiteral("/job.json"), json);
    EXPECT_EQ(kareport::errorOf(read), nullptr) << json.constData();
    return std::get<kareport::JsonSource>(std::move(read));
}

kareport::Job jobOf(const QByteArray &json)
{
    kareport::JsonSource source = sourceOf(json);
    kareport::Job job = readJob(source);
    EXPECT_FALSE(source.failed()) << source.error()->message().toStdString();
    return job;
}

} // namespace jobtext

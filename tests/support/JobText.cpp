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
    auto job = readJob(sourceOf(json));
    if (const auto *error = kareport::errorOf(job)) {
        ADD_FAILURE() << error->message().toStdString();
        return {};
    }
    return std::get<kareport::Job>(std::move(job));
}

} // namespace jobtext

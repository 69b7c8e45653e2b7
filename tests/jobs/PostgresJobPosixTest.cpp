#include "JobOutputs.h"
#include "JobReader.h"
#include "JobRunner.h"

#include "JobFolder.h"
#include "PrivatePostgres.h"
#include "ReportFixture.h"

#include <QFile>
#include <QProcess>

#include <gtest/gtest.h>

namespace
{

TEST(PostgresJob, TheExampleGivesTheReportOfTheTextFile)
{
    PrivatePostgres server;
    if (!server.isRunning()) {
        GTEST_SKIP() << "no server: " << server.reason();
    }
    const QString folder = QStringLiteral(KAREPORT_EXAMPLES_DIR "/postgresql");
    QProcess filling;
    filling.setWorkingDirectory(folder);
    filling.start(QStringLiteral("psql"),
                  {QStringLiteral("-q"), QStringLiteral("-v"), QStringLiteral("ON_ERROR_STOP=1"), QStringLiteral("-d"),
                   server.connection(), QStringLiteral("-f"), QStringLiteral("control.sql")});
    ASSERT_TRUE(filling.waitForFinished(60'000));
    ASSERT_EQ(filling.exitCode(), 0) << filling.readAllStandardError().constData();

    const FixedSurroundings surroundings;
    auto source = std::get<kareport::JsonSource>(kareport::JsonSource::read(folder + QStringLiteral("/control.json")));
    EXPECT_EQ(source.set(QStringLiteral("data.points.postgresql"), server.connection()), std::nullopt);
    const auto job = std::get<kareport::Job>(kareport::readJob(source));
    UReportDoc report(kareport::surroundingsOf(job));
    kareport::Progress progress(false);
    kareport::JobRunner runner(job, source, progress);
    const auto error = runner.run(report);
    ASSERT_FALSE(error) << error->message().toStdString();
    EXPECT_TRUE(runner.notes().all().empty()) << runner.notes().toJson().constData();
    const JobFolder written;
    ASSERT_TRUE(
        kareport::writeOutput(report, {written.path("control.txt"), kareport::OutputKind::Text}, progress).isWritten());
    QFile golden(QStringLiteral(KAREPORT_TEST_DIR "/golden/control-metric.txt"));
    ASSERT_TRUE(golden.open(QIODevice::ReadOnly));
    EXPECT_TRUE(written.bytesOf("control.txt") == golden.readAll());
}

} // namespace

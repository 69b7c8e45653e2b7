#include "JobOutputs.h"
#include "JobReader.h"
#include "JobRunner.h"

#include "PrintQt.h"
#include "ReportFixture.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace
{

QByteArray contentOf(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray("cannot be read");
}

/// The number of the first line that differs, for a message.
qsizetype firstDifference(const QByteArray &left, const QByteArray &right)
{
    const auto [end, other] = std::mismatch(left.begin(), left.end(), right.begin(), right.end());
    return std::count(left.begin(), end, '\n') + 1;
}

/// The examples come out as they did when they were last read. scripts/update-goldens.sh makes them again.
TEST(Golden, EveryExampleComesOutByteForByte)
{
    const QDir examples(QStringLiteral(KAREPORT_EXAMPLES_DIR));
    const QDir goldens(QStringLiteral(KAREPORT_TEST_DIR "/golden"));
    const QStringList jobs = examples.entryList({QStringLiteral("*.json")});
    ASSERT_GE(jobs.size(), 9);
    QTemporaryDir folder;
    for (const QString &name : jobs) {
        const auto source = kareport::JsonSource::read(examples.filePath(name));
        ASSERT_EQ(kareport::errorOf(source), nullptr) << qPrintable(name);
        const auto read = kareport::readJob(std::get<kareport::JsonSource>(source));
        ASSERT_EQ(kareport::errorOf(read), nullptr) << qPrintable(name);
        const auto &job = std::get<kareport::Job>(read);
        UReportDoc report(kareport::surroundingsOf(job));
        kareport::Progress progress(false);
        const auto error = kareport::JobRunner(job, std::get<kareport::JsonSource>(source), progress).run(report);
        ASSERT_FALSE(error) << qPrintable(error->message());
        using kareport::OutputKind;
        const std::pair<OutputKind, const char *> outputs[] = {
            {OutputKind::Report, ".rep"}, {OutputKind::Text, ".txt"}, {OutputKind::RichText, ".rtf"}};
        for (const auto &[kind, ending] : outputs) {
            const QString file = name.chopped(5) + QString::fromLatin1(ending);
            ASSERT_TRUE(kareport::writeOutput(report, {folder.filePath(file), kind}, progress).isWritten())
                << qPrintable(file);
            const QByteArray expected = contentOf(goldens.filePath(file));
            const QByteArray made = contentOf(folder.filePath(file));
            EXPECT_TRUE(made == expected)
                << qPrintable(file) << " differs from line " << firstDifference(made, expected);
        }
    }
}

} // namespace

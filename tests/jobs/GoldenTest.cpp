#include "JobReader.h"
#include "JobRunner.h"
#include "OutputWriter.h"

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

/// The examples come out as they did when somebody last read them. scripts/update-goldens.sh makes them anew.
TEST(Golden, EveryExampleComesOutByteForByte)
{
    const QDir examples(QStringLiteral(KAREPORT_EXAMPLES_DIR));
    const QDir goldens(QStringLiteral(KAREPORT_TEST_DIR "/golden"));
    const QStringList jobs = examples.entryList({QStringLiteral("*.json")});
    ASSERT_GE(jobs.size(), 9);
    QTemporaryDir folder;
    for (const QString &name : jobs) {
        auto read = kareport::JsonSource::read(examples.filePath(name));
        ASSERT_EQ(kareport::errorOf(read), nullptr) << qPrintable(name);
        auto &source = std::get<kareport::JsonSource>(read);
        const kareport::Job job = kareport::readJob(source);
        ASSERT_FALSE(source.failed()) << qPrintable(source.error()->message());
        kareport::Progress progress(false);
        kareport::JobRunner runner(job, source, progress);
        const auto error = runner.run();
        ASSERT_FALSE(error) << qPrintable(error->message());
        using kareport::OutputKind;
        const std::pair<OutputKind, const char *> outputs[] = {
            {OutputKind::Report, ".rep"}, {OutputKind::Text, ".txt"}, {OutputKind::RichText, ".rtf"}};
        for (const auto &[kind, ending] : outputs) {
            const QString file = name.chopped(5) + QString::fromLatin1(ending);
            QStringList warnings;
            ASSERT_FALSE(kareport::writeOutput(runner.report(), {folder.filePath(file), kind}, progress, warnings))
                << qPrintable(file);
            const QByteArray expected = contentOf(goldens.filePath(file));
            const QByteArray made = contentOf(folder.filePath(file));
            EXPECT_TRUE(made == expected)
                << qPrintable(file) << " differs from line " << firstDifference(made, expected);
        }
    }
}

} // namespace

#include "JobCheck.h"

#include "JobRunnerFixture.h"

namespace
{

using jobs::TestJob;
using kareport::CheckedFile;

/// Checks a job with the steps of `jobs::templateJob`.
CheckedFile checked(const TestJob &test, const QByteArray &steps, const char *more = "", bool isStrict = false,
                    const QString &notesFile = QString())
{
    test.folder.put("t.xml", jobs::pointsTemplate().replace("Nowhere", "Survey")); // all dictionaries are there
    test.folder.put("job.json",
                    jobs::fixedFront +
                        jobs::templateJob(R"("p": {"values": [{"Number": "123456", "Northing": 12.5}]})", steps, more) +
                        '}');
    const QString file = test.folder.path("job.json");
    kareport::Progress progress(false);
    return kareport::checkJob(file, kareport::JsonSource::read(file), isStrict, notesFile, progress);
}

QStringList textsOf(const CheckedFile &checked)
{
    QStringList texts;
    for (const kareport::CheckRemark &remark : checked.remarks) {
        texts.append((remark.isError ? QStringLiteral("error: ") : QStringLiteral("warning: ")) + remark.about.text);
    }
    return texts;
}

TEST(JobCheck, ASoundJobHasItsStepsAndWritesNothing)
{
    const TestJob test;
    const QString output = test.folder.path("a.txt");
    const CheckedFile about = checked(test, R"({"block": "Point", "data": "p"}, {"table": "Points", "data": "p"})",
                                      R"("output": ["a.txt"], )");
    EXPECT_TRUE(about.isJob);
    EXPECT_FALSE(about.hasErrors()) << textsOf(about).join(u'\n').toStdString();
    ASSERT_EQ(about.steps.size(), 2U);
    EXPECT_EQ(about.steps[1].name, QStringLiteral("Points"));
    EXPECT_FALSE(QFile::exists(output));
}

TEST(JobCheck, WhatIsNotedIsAnErrorWhereTheCallerOrTheJobIsStrict)
{
    const char *const steps = R"({"table": "Points", "data": "p"})";
    const TestJob test;
    const CheckedFile lenient = checked(test, steps);
    EXPECT_FALSE(lenient.hasErrors()) << textsOf(lenient).join(u'\n').toStdString();
    EXPECT_EQ(lenient.remarks.size(), 2U)
        << "an assumed unit and a wide value: " << textsOf(lenient).join(u'\n').toStdString();
    EXPECT_TRUE(checked(test, steps, "", true).hasErrors());
    EXPECT_TRUE(checked(test, steps, R"("strict": true, )").hasErrors());
}

TEST(JobCheck, NotesDoNotReplaceAFileOfTheJob)
{
    const TestJob test;
    const CheckedFile about = checked(test, R"({"line": "a"})", "", false, test.folder.path("t.xml"));
    EXPECT_TRUE(about.isNotesFileNeeded);
    EXPECT_TRUE(about.hasErrors());
    EXPECT_FALSE(checked(test, R"({"line": "a"})", "", false, test.folder.path("n.json")).isNotesFileNeeded);
}

TEST(JobCheck, AJobThatCannotBeReadIsItsError)
{
    kareport::Progress progress(false);
    const QString file = QStringLiteral("/nowhere/job.json");
    const CheckedFile about = kareport::checkJob(file, kareport::JsonSource::read(file), false, QString(), progress);
    EXPECT_EQ(about.file, file);
    EXPECT_TRUE(about.hasErrors());
    EXPECT_TRUE(about.steps.empty());
}

} // namespace

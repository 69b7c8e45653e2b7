#pragma once

#include "FailingFiles.h"
#include "FrameFixture.h"
#include "ReportFixture.h"
#include "TestSize.h"

#include <QDir>
#include <QFileInfo>

#include <gtest/gtest.h>

#include <string>

inline constexpr FailingFiles::Call failingCalls[] = {FailingFiles::Call::Write, FailingFiles::Call::ShortWrite,
                                                      FailingFiles::Call::Flush, FailingFiles::Call::Rename};
inline constexpr const char *failingCallNames[] = {"write", "short write", "flush", "rename"};

/// Lets a save fail at each of its calls in turn.
/// @param prepare  is called before each
/// @param save     saves over a file that holds "earlier". @return whether it says that it did
/// @param failed   is called after each that has failed
template <typename Prepare, typename Save, typename Failed>
void failEachCall(const QString &path, Prepare prepare, Save save, Failed failed)
{
    QString folder = QFileInfo(path).absolutePath();
    for (const FailingFiles::Call call : failingCalls) {
        // A second wait for the same bytes, which Qt adds, fails on no disk: they are there.
        const qint64 last = call == FailingFiles::Call::Flush ? 1 : 1000;
        qint64 number = 1;
        for (bool hasFailed = true; hasFailed && number <= last; ++number) {
            SCOPED_TRACE(std::string(failingCallNames[static_cast<int>(call)]) + " " + std::to_string(number));
            putFile(path, "earlier");
            const auto names = QDir(folder).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot);
            prepare();
            bool isSaved = false;
            {
                const FailingFiles failing(call, number);
                isSaved = save();
                hasFailed = failing.hasFailed();
            }
            EXPECT_EQ(isSaved, !hasFailed);
            EXPECT_EQ(contentOf(path) == "earlier", hasFailed) << "the earlier file is whole, or the new one is there";
            EXPECT_EQ(QDir(folder).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot), names)
                << "nothing is left beside it";
            if (hasFailed) {
                failed();
            }
            if (testing::Test::HasFailure()) {
                return;
            }
        }
        EXPECT_GT(number, call == FailingFiles::Call::Flush ? 1 : 2)
            << failingCallNames[static_cast<int>(call)] << ": it is never called";
    }
}

/// The lines of a report's text of more than is buffered at once. It is of two bytes a character, and a PDF needs one face
/// for it.
inline int longTextLines()
{
    return testSize(2'000, 10'000);
}

inline const QString &longText()
{
    static const QString text = reportLines(QStringLiteral("a line of a report \u0142\n").repeated(longTextLines()));
    return text;
}

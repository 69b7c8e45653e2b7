#include "CommandLine.h"

#include "JobFolder.h"

#include <gtest/gtest.h>

namespace
{

TEST(ProgramArgumentsOnWindows, APatternStandsForTheFilesThatFit)
{
    const CommandLineFolder folder;
    folder.put("a.txt", "");
    // Each file is a template file that is checked; a.txt does not fit.
    folder.put("\xC3\xBC.xml", controlTemplates());
    const ProgramRun run = runProgram(folder.path(), words("check *.xml"));
    EXPECT_EQ(run.status, 0) << run.err.toStdString();
    const ProgramRun none = runProgram(folder.path(), words("check *.csv9"));
    EXPECT_NE(none.status, 0);
    EXPECT_TRUE(none.err.contains("*.csv9")) << none.err.toStdString();
}

} // namespace

#pragma once

namespace kareport
{

/// The words of a command line in the bytes that `textOfSystem` reads: those that a program is given, or where the system
/// has better ones, these. Names with * and ? are replaced by the files that they match, where no shell has done so.
struct ProgramArguments
{
    int count = 0;
    char **words = nullptr; ///< as of `main`; they live as long as the program

    static ProgramArguments of(int argc, char **argv);
};

} // namespace kareport

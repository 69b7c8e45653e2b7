#pragma once

namespace kareport
{

/// The words of a command line in the bytes that `textOfSystem` reads: those that a program is given, or where the system
/// has better ones, these. Names with * and ? stand for the files that they fit, where no shell has seen to that.
struct ProgramArguments
{
    int count = 0;
    char **words = nullptr; ///< as of `main`; they live as long as the program

    static ProgramArguments of(int argc, char **argv);
};

} // namespace kareport

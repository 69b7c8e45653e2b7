#pragma once

#include <QtGlobal>

/// Whether tests take their full sizes. `./test` takes the smaller ones, which show the same in less time; `./test --all`
/// runs the suites that a folder names SIZED once more with the full ones (KAREPORT_TEST_SIZE=full).
inline bool hasFullSize()
{
    return qEnvironmentVariable("KAREPORT_TEST_SIZE") == u"full";
}

/// How much a test does: runs, lines, reports.
inline int testSize(int usual, int full)
{
    return hasFullSize() ? full : usual;
}

#pragma once

#include <QElapsedTimer>
#include <QtGlobal>

#include <cstdio>

/// The runs of a random test, each with its own seed: so many of them, or those that fit into a time.
///
/// KAREPORT_RANDOM_SEED is the first seed, and KAREPORT_RANDOM_SECONDS the time. Without them every run of the tests is the
/// same, however fast the machine is.
class RandomRuns
{
public:
    RandomRuns(const char *what, quint64 firstSeed, int runs);
    ~RandomRuns();
    RandomRuns(const RandomRuns &) = delete;
    RandomRuns &operator=(const RandomRuns &) = delete;

    /// Goes on to the next run. @return whether there is one
    bool next();
    /// The seed of this run: as the first seed it brings the run about again.
    quint64 seed() const { return seed_; }

private:
    const char *what_;
    int runs_;
    int seconds_ = 0;
    int done_ = 0;
    quint64 seed_ = 0;
    QElapsedTimer timer_;
};

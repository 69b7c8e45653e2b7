#include "RandomRuns.h"

RandomRuns::RandomRuns(const char *what, quint64 firstSeed, int runs) : what_(what), runs_(runs)
{
    const quint64 given = qEnvironmentVariable("KAREPORT_RANDOM_SEED").toULongLong();
    seed_ = given != 0 ? given : firstSeed;
    seconds_ = qEnvironmentVariableIntValue("KAREPORT_RANDOM_SECONDS");
    std::printf("%s: first seed %llu\n", what_, static_cast<unsigned long long>(seed_));
    std::fflush(stdout);
    --seed_;
    timer_.start();
}

RandomRuns::~RandomRuns()
{
    std::printf("%s: %d runs, last seed %llu\n", what_, done_, static_cast<unsigned long long>(seed_));
}

bool RandomRuns::next()
{
    if (seconds_ > 0 ? timer_.elapsed() >= seconds_ * 1000LL : done_ >= runs_) {
        return false;
    }
    ++seed_;
    ++done_;
    return true;
}

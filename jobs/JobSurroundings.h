#pragma once

#include "DefaultPrinter.h"
#include "Job.h"
#include "Profile.h"

#include <QString>

#include <memory>

namespace kareport
{

/// What a job is run in: what is printed must not depend on the preferences, the printer and the clock of whoever runs it.
/// The program's own surroundings come back with the end of this object.
class JobSurroundings
{
public:
    explicit JobSurroundings(const Job &job);
    ~JobSurroundings();
    JobSurroundings(const JobSurroundings &) = delete;
    JobSurroundings &operator=(const JobSurroundings &) = delete;

private:
    std::unique_ptr<ProfileStore> profile_;
    DefaultPrinter printer_;
    QString application_;
};

} // namespace kareport

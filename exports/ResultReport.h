#pragma once

#include <QDateTime>
#include <QString>

namespace kareport
{

/// What a report is called and when it was made.
struct ResultReport
{
    QString title;
    QString application;
    QDateTime time;
};

} // namespace kareport

#include "Commands.h"

#include "TerminalProgress.h"
#include "VisibleText.h"

#include <QStringList>

#include <cstdio>

namespace kareport
{

void printLine(const QString &line)
{
    // A tab stands between the columns of a list.
    QStringList columns = line.split(u'\t');
    for (QString &column : columns) {
        column = visibleText(column);
    }
    std::fprintf(stdout, "%s\n", columns.join(u'\t').toUtf8().constData());
}

void printError(const QString &line)
{
    eraseProgress();
    std::fprintf(stderr, "%s\n", visibleText(line).toUtf8().constData());
}

} // namespace kareport

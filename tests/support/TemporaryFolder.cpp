#include "TemporaryFolder.h"

TemporaryFolder::TemporaryFolder(const QString &suffix)
    : unix_(qgetenv("TMPDIR")),
      windows_(qgetenv("TMP")),
      isUnixSet_(qEnvironmentVariableIsSet("TMPDIR")),
      isWindowsSet_(qEnvironmentVariableIsSet("TMP"))
{
    set(folder_.path() + suffix);
}

TemporaryFolder::~TemporaryFolder()
{
    restore("TMPDIR", unix_, isUnixSet_);
    restore("TMP", windows_, isWindowsSet_);
}

void TemporaryFolder::set(const QString &path)
{
    qputenv("TMPDIR", path.toLocal8Bit());
    qputenv("TMP", path.toLocal8Bit());
}

void TemporaryFolder::restore(const char *name, const QByteArray &value, bool isSet)
{
    if (isSet) {
        qputenv(name, value);
    } else {
        qunsetenv(name);
    }
}

#include "WriteFailure.h"

#include <cerrno>
#include <system_error>
#include <unistd.h>

namespace kareport
{

QString whyWritingFails(int handle)
{
    return write(handle, "", 1) < 0 ? QString::fromStdString(std::generic_category().message(errno)) : QString();
}

} // namespace kareport

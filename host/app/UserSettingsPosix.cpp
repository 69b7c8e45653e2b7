#include "UserSettings.h"

namespace kareport
{

std::unique_ptr<QSettings> userSettings()
{
    return std::make_unique<QSettings>(QStringLiteral("KaReport"), QStringLiteral("KaReport"));
}

} // namespace kareport

#include "UserSettings.h"

namespace kareport
{

std::unique_ptr<QSettings> userSettings()
{
    // A file in %APPDATA%, which goes with the user from machine to machine; the registry is Qt's own choice.
    return std::make_unique<QSettings>(QSettings::IniFormat, QSettings::UserScope, QStringLiteral("KaReport"),
                                       QStringLiteral("KaReport"));
}

} // namespace kareport

#pragma once

#include "KaReportExport.h"

#include <QString>

#include <memory>

/// The application's profile entry of a name in a section ("" is the application's own), or `fallback` when there is
/// none. Throws std::bad_alloc without memory: the fallback would pass for what the user has set.
KAREPORT_EXPORT QString GetProfileString(const QString &section, const QString &entry,
                                         const QString &fallback = QString());
/// Stores a profile entry; without memory, an earlier one stays.
KAREPORT_EXPORT void WriteProfileString(const QString &section, const QString &entry, const QString &value);

namespace kareport
{

/// Where profile entries are kept.
class KAREPORT_EXPORT ProfileStore
{
public:
    virtual ~ProfileStore();
    /// The value of an entry, or `fallback` when there is none.
    virtual QString read(const QString &section, const QString &entry, const QString &fallback) const = 0;
    /// Stores an entry, in place of an earlier value.
    virtual void write(const QString &section, const QString &entry, const QString &value) = 0;
};

/// Entries in the platform's settings store of the application or, with a path, in that file.
KAREPORT_EXPORT std::unique_ptr<ProfileStore> makeSettingsProfile(const QString &path = QString());
/// Entries that are forgotten with the process: for programs whose output must not depend on a user's preferences.
KAREPORT_EXPORT std::unique_ptr<ProfileStore> makeMemoryProfile();

/// The store that the functions above work on; null restores the platform's settings store.
KAREPORT_EXPORT void setProfileStore(std::unique_ptr<ProfileStore> store);
/// The same. @return the store before, which may be null
KAREPORT_EXPORT std::unique_ptr<ProfileStore> exchangeProfileStore(std::unique_ptr<ProfileStore> store);

} // namespace kareport

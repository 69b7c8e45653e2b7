#include "Profile.h"

#include "MemoryLasts.h"
#include "UserSettings.h"

#include <QHashFunctions>
#include <QSettings>

#include <unordered_map>
#include <utility>

namespace kareport
{

namespace
{

QString keyOf(const QString &section, const QString &entry)
{
    return section.isEmpty() ? entry : section + u'/' + entry;
}

class SettingsProfile : public ProfileStore
{
public:
    explicit SettingsProfile(const QString &path)
        : settings_(path.isEmpty() ? userSettings() : std::make_unique<QSettings>(path, QSettings::IniFormat))
    {}

    QString read(const QString &section, const QString &entry, const QString &fallback) const override
    {
        // A text with commas that was written into the file by hand is read as a list.
        const QVariant value = settings_->value(keyOf(section, entry), fallback);
        return value.typeId() == QMetaType::QStringList ? value.toStringList().join(QStringLiteral(", "))
                                                        : value.toString();
    }

    void write(const QString &section, const QString &entry, const QString &value) override
    {
        settings_->setValue(keyOf(section, entry), value);
    }

private:
    std::unique_ptr<QSettings> settings_;
};

class MemoryProfile : public ProfileStore
{
public:
    QString read(const QString &section, const QString &entry, const QString &fallback) const override
    {
        const auto found = entries_.find(keyOf(section, entry));
        return found != entries_.end() ? found->second : fallback;
    }

    void write(const QString &section, const QString &entry, const QString &value) override
    {
        entries_.insert_or_assign(keyOf(section, entry), value);
    }

private:
    std::unordered_map<QString, QString> entries_;
};

std::unique_ptr<ProfileStore> &currentStore()
{
    static std::unique_ptr<ProfileStore> store;
    return store;
}

ProfileStore &profileStore()
{
    auto &store = currentStore();
    if (!store) {
        store = makeSettingsProfile();
    }
    return *store;
}

} // namespace

ProfileStore::~ProfileStore() = default;

std::unique_ptr<ProfileStore> makeSettingsProfile(const QString &path)
{
    return std::make_unique<SettingsProfile>(path);
}

std::unique_ptr<ProfileStore> makeMemoryProfile()
{
    return std::make_unique<MemoryProfile>();
}

void setProfileStore(std::unique_ptr<ProfileStore> store)
{
    currentStore() = std::move(store);
}

std::unique_ptr<ProfileStore> exchangeProfileStore(std::unique_ptr<ProfileStore> store)
{
    return std::exchange(currentStore(), std::move(store));
}

} // namespace kareport

QString GetProfileString(const QString &section, const QString &entry, const QString &fallback)
{
    return kareport::profileStore().read(section, entry, fallback);
}

void WriteProfileString(const QString &section, const QString &entry, const QString &value)
{
    kareport::doneWhileMemoryLasts([&] { kareport::profileStore().write(section, entry, value); });
}

#include "Profile.h"

#include "PrintQt.h"

#include <QFile>
#include <QFileInfo>
#include <QSettings>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace
{

using kareport::makeMemoryProfile;
using kareport::makeSettingsProfile;
using kareport::ProfileStore;
using kareport::setProfileStore;

/// Leaves a store of its own behind, as the tests begin with.
class ProfileRestored
{
public:
    ProfileRestored() = default;
    ~ProfileRestored() { setProfileStore(makeMemoryProfile()); }
    ProfileRestored(const ProfileRestored &) = delete;
    ProfileRestored &operator=(const ProfileRestored &) = delete;
};

/// Lets the platform's settings store of the application live in a folder that is removed after the test.
class RedirectedSettings
{
public:
    RedirectedSettings() : usual_(folderOf(applicationFile()))
    {
        QSettings::setPath(QSettings::NativeFormat, QSettings::UserScope, folder_.path());
    }
    ~RedirectedSettings() { QSettings::setPath(QSettings::NativeFormat, QSettings::UserScope, usual_); }
    RedirectedSettings(const RedirectedSettings &) = delete;
    RedirectedSettings &operator=(const RedirectedSettings &) = delete;

    static QString applicationFile()
    {
        return QSettings(QStringLiteral("KaReport"), QStringLiteral("KaReport")).fileName();
    }
    QString folder() const { return folder_.path(); }

private:
    static QString folderOf(const QString &file) { return QFileInfo(QFileInfo(file).path()).path(); }

    QString usual_;
    QTemporaryDir folder_;
};

struct ValueRow
{
    QStringView value;
    const char *reason;
};

constexpr ValueRow valueRows[] = {
    {u"", "empty"},
    {u"plain", "a word"},
    {u"/opt/my editor/edit --wait", "blanks inside"},
    {u"  both ends  ", "blanks at both ends"},
    {u" ", "a blank alone"},
    {u"one, two,three", "commas"},
    {u",", "a comma alone"},
    {u",,", "commas alone"},
    {u"C:\\Program Files\\Edit, new\\edit.exe", "backslashes, blanks and a comma"},
    {u"\"quoted\"", "quotes at both ends"},
    {u"say \"hello\", then 'bye'", "quotes inside"},
    {u"a=b;c#d%20[e]", "what has a meaning in a settings file"},
    {u"@Invalid()", "what has a meaning in a settings file, at the front"},
    {u"@@note", "two at signs"},
    {u"two\nlines\tand a tab\r", "control characters"},
    {u"é測量😀", "characters beyond ASCII"},
    {QStringView(u"a\0b", 3), "a character 0"},
    {u"true", "looks like a boolean"},
    {u"007", "looks like a number"},
};

TEST(Profile, SettingsComeBackFromTheFile)
{
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("settings.ini"));
    const auto nameOf = [](std::size_t i) { return QStringLiteral("Entry %1").arg(i); };
    {
        const auto store = makeSettingsProfile(path);
        for (std::size_t i = 0; i < std::size(valueRows); ++i) {
            store->write(QString(), nameOf(i), valueRows[i].value.toString());
            store->write(QStringLiteral("My Section"), nameOf(i), valueRows[i].value.toString() + u'!');
            EXPECT_EQ(store->read(QString(), nameOf(i), QStringLiteral("fallback")), valueRows[i].value.toString())
                << valueRows[i].reason << ", at once";
        }
    }
    ASSERT_TRUE(QFile::exists(path));
    const auto store = makeSettingsProfile(path);
    for (std::size_t i = 0; i < std::size(valueRows); ++i) {
        EXPECT_EQ(store->read(QString(), nameOf(i), QStringLiteral("fallback")), valueRows[i].value.toString())
            << valueRows[i].reason;
        EXPECT_EQ(store->read(QStringLiteral("My Section"), nameOf(i), QString()), valueRows[i].value.toString() + u'!')
            << valueRows[i].reason << ", in a section";
    }
}

TEST(Profile, MemoryKeepsEveryValue)
{
    const auto store = makeMemoryProfile();
    for (const ValueRow &row : valueRows) {
        store->write(QStringLiteral("Section"), QStringLiteral("Entry"), row.value.toString());
        EXPECT_EQ(store->read(QStringLiteral("Section"), QStringLiteral("Entry"), QStringLiteral("fallback")),
                  row.value.toString())
            << row.reason;
    }
    EXPECT_EQ(makeMemoryProfile()->read(QStringLiteral("Section"), QStringLiteral("Entry"), QStringLiteral("none")),
              QStringLiteral("none"))
        << "another one knows nothing of it";
}

void expectEntriesKeptApart(ProfileStore &store)
{
    const QString section = QStringLiteral("Section");
    const QString entry = QStringLiteral("Entry");
    EXPECT_EQ(store.read(section, entry, QStringLiteral("fallback")), QStringLiteral("fallback")) << "not there";
    EXPECT_EQ(store.read(section, entry, QString()), QString()) << "not there, without a fallback";
    store.write(section, entry, QStringLiteral("in a section"));
    EXPECT_EQ(store.read(QString(), entry, QStringLiteral("fallback")), QStringLiteral("fallback"))
        << "the application's own is another one";
    store.write(QString(), entry, QStringLiteral("own"));
    store.write(QStringLiteral("General"), entry, QStringLiteral("general"));
    store.write(QStringLiteral("Other"), entry, QStringLiteral("other"));
    store.write(section, QStringLiteral("Entry 2"), QStringLiteral("second"));
    EXPECT_EQ(store.read(section, entry, QString()), QStringLiteral("in a section"));
    EXPECT_EQ(store.read(QString(), entry, QString()), QStringLiteral("own"));
    EXPECT_EQ(store.read(QStringLiteral("General"), entry, QString()), QStringLiteral("general"))
        << "a section of this name is not the application's own";
    EXPECT_EQ(store.read(QStringLiteral("Other"), entry, QString()), QStringLiteral("other"));
    EXPECT_EQ(store.read(section, QStringLiteral("Entry 2"), QString()), QStringLiteral("second"));
    store.write(section, entry, QStringLiteral("again"));
    EXPECT_EQ(store.read(section, entry, QString()), QStringLiteral("again")) << "the last one holds";
    store.write(section, entry, QString());
    EXPECT_EQ(store.read(section, entry, QStringLiteral("fallback")), QString()) << "an empty entry is one";
}

TEST(Profile, EntriesAreKeptApart)
{
    const QTemporaryDir folder;
    expectEntriesKeptApart(*makeSettingsProfile(folder.filePath(QStringLiteral("settings.ini"))));
    expectEntriesKeptApart(*makeMemoryProfile());
}

TEST(Profile, ATextWithCommasWrittenByHandIsOneText)
{
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("settings.ini"));
    QFile file(path);
    ASSERT_TRUE(file.open(QIODevice::WriteOnly));
    file.write("[General]\nEditor=/opt/my edit, new, newest\nPlain=/usr/bin/edit\n");
    file.close();
    const auto store = makeSettingsProfile(path);
    EXPECT_EQ(store->read(QString(), QStringLiteral("Editor"), QString()), QStringLiteral("/opt/my edit, new, newest"));
    EXPECT_EQ(store->read(QString(), QStringLiteral("Plain"), QString()), QStringLiteral("/usr/bin/edit"));
}

TEST(Profile, AFileThatCannotBeReadGivesTheFallback)
{
    const QTemporaryDir folder;
    struct Row
    {
        QString path;
        const char *reason;
    };
    const Row rows[] = {
        {folder.filePath(QStringLiteral("missing/settings.ini")), "a folder that is missing"},
        {folder.path(), "a folder"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(makeSettingsProfile(row.path)->read(QString(), QStringLiteral("Entry"), QStringLiteral("fallback")),
                  QStringLiteral("fallback"))
            << row.reason;
    }
}

TEST(Profile, TheFunctionsWorkOnTheStoreThatWasSet)
{
    const ProfileRestored restored;
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("settings.ini"));
    setProfileStore(makeSettingsProfile(path));
    EXPECT_EQ(GetProfileString(QString(), QStringLiteral("Entry"), QStringLiteral("fallback")),
              QStringLiteral("fallback"));
    EXPECT_EQ(GetProfileString(QString(), QStringLiteral("Entry")), QString()) << "without a fallback";
    WriteProfileString(QString(), QStringLiteral("Entry"), QStringLiteral("one, two"));
    WriteProfileString(QStringLiteral("Section"), QStringLiteral("Entry"), QStringLiteral("three"));
    EXPECT_EQ(GetProfileString(QString(), QStringLiteral("Entry")), QStringLiteral("one, two"));

    setProfileStore(makeMemoryProfile());
    EXPECT_EQ(GetProfileString(QString(), QStringLiteral("Entry"), QStringLiteral("fallback")),
              QStringLiteral("fallback"))
        << "another store";
    setProfileStore(makeSettingsProfile(path));
    EXPECT_EQ(GetProfileString(QString(), QStringLiteral("Entry")), QStringLiteral("one, two")) << "the first again";
    EXPECT_EQ(GetProfileString(QStringLiteral("Section"), QStringLiteral("Entry")), QStringLiteral("three"));
}

TEST(Profile, WithoutAStoreTheEntriesLiveInTheUsualSettings)
{
    const ProfileRestored restored;
    const RedirectedSettings settings;
    ASSERT_TRUE(RedirectedSettings::applicationFile().startsWith(settings.folder())) << "not a user's own file";
    setProfileStore(nullptr);
    WriteProfileString(QString(), QStringLiteral("Entry"), QStringLiteral("kept"));
    setProfileStore(makeMemoryProfile());
    EXPECT_TRUE(QFile::exists(RedirectedSettings::applicationFile()));
    EXPECT_EQ(GetProfileString(QString(), QStringLiteral("Entry")), QString());
    setProfileStore(nullptr);
    EXPECT_EQ(GetProfileString(QString(), QStringLiteral("Entry")), QStringLiteral("kept"));
    EXPECT_EQ(makeSettingsProfile()->read(QString(), QStringLiteral("Entry"), QString()), QStringLiteral("kept"))
        << "no path means the same";
}

} // namespace

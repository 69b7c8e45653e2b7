#include "Language.h"

#include "Xlate.h"

#include <QCoreApplication>
#include <QFile>
#include <QLibraryInfo>

#include <gtest/gtest.h>

namespace
{

class Languages : public testing::Test
{
protected:
    void TearDown() override { kareport::setLanguage(QStringLiteral("en")); }
};

TEST_F(Languages, GermanAndJapaneseAreThere)
{
    EXPECT_EQ(kareport::translatedLanguages(), QStringList({QStringLiteral("de"), QStringLiteral("ja")}));
}

TEST_F(Languages, TextsFollowTheLanguage)
{
    struct Row
    {
        const char *language;
        const char *holds;
        const char *reason;
    };
    const QString english = Xlate("Untitled");
    for (const Row &row :
         {Row{"de", "de", "German"}, Row{"de_AT", "de", "a country's German"}, Row{"ja", "ja", "Japanese"},
          Row{"en", "en", "English has no file"}, Row{"xx", "en", "a language that there is none of"}})
    {
        EXPECT_EQ(kareport::setLanguage(QString::fromUtf8(row.language)), QString::fromUtf8(row.holds)) << row.reason;
        EXPECT_EQ(Xlate("Untitled") == english, QString::fromUtf8(row.holds) == QStringLiteral("en")) << row.reason;
    }
}

TEST_F(Languages, ANoteForTranslatorsIsNeverShown)
{
    for (const char *language : {"de", "ja", "en"}) {
        kareport::setLanguage(QString::fromUtf8(language));
        EXPECT_FALSE(Xlate("Error@@Alert Message title").contains(u'@')) << language;
        EXPECT_FALSE(Xlate("Error@@Alert Message title").isEmpty()) << language;
    }
}

TEST_F(Languages, QtsOwnTextsFollowWhereTheyAreInstalled)
{
    const char *const cancel = "Cancel";
    ASSERT_EQ(kareport::setLanguage(QStringLiteral("de")), QStringLiteral("de"));
    if (!QFile::exists(QLibraryInfo::path(QLibraryInfo::TranslationsPath) + QStringLiteral("/qtbase_de.qm"))) {
        GTEST_SKIP() << "Qt's translations are not installed";
    }
    EXPECT_EQ(QCoreApplication::translate("QPlatformTheme", cancel), QStringLiteral("Abbrechen"));
    kareport::setLanguage(QStringLiteral("en"));
    EXPECT_EQ(QCoreApplication::translate("QPlatformTheme", cancel), QString::fromUtf8(cancel));
}

} // namespace

#include "Preferences.h"

#include "PrintQt.h"
#include "Profile.h"

#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <limits>

namespace
{

/// A profile without entries, for one test.
class EmptyProfile
{
public:
    EmptyProfile() { kareport::setProfileStore(kareport::makeMemoryProfile()); }
    ~EmptyProfile() { kareport::setProfileStore(kareport::makeMemoryProfile()); }
    EmptyProfile(const EmptyProfile &) = delete;
    EmptyProfile &operator=(const EmptyProfile &) = delete;
};

TEST(Preferences, OfAUserWhoHasChosenNothing)
{
    const EmptyProfile profile;
    EXPECT_EQ(GetReportFontSize(), 8U);
    EXPECT_TRUE(IsReportPrinterSetToPortrait());
    EXPECT_EQ(GetUsePreferredReportEditorFlag(), 0);
    EXPECT_FALSE(GetPreferredReportEditorRegKey().isEmpty());
    EXPECT_EQ(GetProfileString(QString(), GetPreferredReportEditorRegKey()), QString());
}

TEST(Preferences, AreKept)
{
    const EmptyProfile profile;
    for (const unsigned size : {1U, 10U, 72U, std::numeric_limits<unsigned>::max()}) {
        SetReportFontSize(size);
        EXPECT_EQ(GetReportFontSize(), size);
    }
    SetReportFontSize(0);
    EXPECT_EQ(GetReportFontSize(), 8U) << "no size is the usual one";
    for (const bool on : {false, true}) {
        SetReportPrinterSetToPortrait(on);
        EXPECT_EQ(IsReportPrinterSetToPortrait(), on);
        SetUsePreferredReportEditorFlag(!on);
        EXPECT_EQ(GetUsePreferredReportEditorFlag() != 0, !on);
        EXPECT_EQ(IsReportPrinterSetToPortrait(), on) << "each for itself";
    }
    WriteProfileString(QString(), GetPreferredReportEditorRegKey(), QStringLiteral("/opt/my editor, new/edit"));
    EXPECT_EQ(GetProfileString(QString(), GetPreferredReportEditorRegKey()),
              QStringLiteral("/opt/my editor, new/edit"));
    EXPECT_EQ(GetReportFontSize(), 8U) << "each for itself";
}

TEST(Preferences, LiveInTheProfile)
{
    const EmptyProfile profile;
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("settings.ini"));
    kareport::setProfileStore(kareport::makeSettingsProfile(path));
    SetReportFontSize(11);
    SetReportPrinterSetToPortrait(false);
    SetUsePreferredReportEditorFlag(true);
    kareport::setProfileStore(kareport::makeMemoryProfile());
    EXPECT_EQ(GetReportFontSize(), 8U) << "another profile";
    kareport::setProfileStore(kareport::makeSettingsProfile(path));
    EXPECT_EQ(GetReportFontSize(), 11U);
    EXPECT_FALSE(IsReportPrinterSetToPortrait());
    EXPECT_NE(GetUsePreferredReportEditorFlag(), 0);
}

/// Answers every entry with the same text.
class OneAnswer : public kareport::ProfileStore
{
public:
    explicit OneAnswer(QString text) : text_(std::move(text)) {}
    QString read(const QString &, const QString &, const QString &) const override { return text_; }
    void write(const QString &, const QString &, const QString &) override {}

private:
    QString text_;
};

TEST(Preferences, AFontSizeThatIsNotValidIsTheUsualOne)
{
    const EmptyProfile profile;
    struct Row
    {
        QStringView entry;
        unsigned expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"", 8, "empty"},
        {u"0", 8, "zero"},
        {u"-3", 8, "negative"},
        {u"large", 8, "no number"},
        {u"12pt", 8, "more than a number"},
        {u"99999999999", 8, "beyond 32 bits"},
        {u"12", 12, "a size"},
    };
    for (const Row &row : rows) {
        kareport::setProfileStore(std::make_unique<OneAnswer>(row.entry.toString()));
        EXPECT_EQ(GetReportFontSize(), row.expected) << row.reason;
    }
}

} // namespace

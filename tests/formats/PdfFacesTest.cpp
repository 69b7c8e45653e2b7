#include "PdfFaces.h"
#include "PdfFixture.h"

#include <gtest/gtest.h>

#include <chrono>
#include <filesystem>

namespace
{

using kareport::PdfFace;
using kareport::preferredPdfFace;

PdfFace dejaVu()
{
    return {dejaVuFile(), 0, false};
}

PdfFace zenHei()
{
    return {zenHeiFile(), 0, true};
}

TEST(PdfFaces, KnowWhatTheyCover)
{
    struct Row
    {
        char32_t character;
        bool dejaVu;
        bool zenHei;
        const char *reason;
    };
    constexpr Row rows[] = {
        {U'A', true, true, "ASCII"},
        {U'é', true, true, "Latin-1"},
        {U'∞', true, true, "a sign"},
        {U'測', false, true, "CJK"},
        {U'⧫', true, false, "a lozenge"},
        {U'😀', false, false, "beyond U+FFFF"},
        {U'\U0001D538', false, false, "beyond U+FFFF, although the face has it"},
        {0x110000, false, false, "no character"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(dejaVu().covers(row.character), row.dejaVu) << row.reason;
        EXPECT_EQ(zenHei().covers(row.character), row.zenHei) << row.reason;
    }
}

TEST(PdfFaces, AFileThatIsNotAFontCoversNothing)
{
    FontFolder folder;
    folder.withText(QStringLiteral("text.ttf"), "no font").withText(QStringLiteral("empty.ttf"), "");
    for (const char *name : {"text.ttf", "empty.ttf", "missing.ttf", "."}) {
        const PdfFace face(QDir(folder.path()).filePath(QString::fromUtf8(name)), 0, false);
        EXPECT_FALSE(face.covers(U'A')) << name;
    }
    EXPECT_FALSE(PdfFace(zenHeiFile(), 99, true).covers(U'A')) << "a collection has no such face";
}

TEST(PdfFaces, ThePreferredOneIsLookedForByName)
{
    const QString gothic = QStringLiteral("MSGOTHIC.TTC");
    const QString lucida = QStringLiteral("lucon.TTF");
    FontFolder both;
    both.withText(gothic, "g").withText(lucida, "l");
    FontFolder gothicOnly;
    gothicOnly.withText(QStringLiteral("msgothic.ttc"), "g").withText(QStringLiteral("MSGOTHIC.TTC.bak"), "x");
    FontFolder lucidaOnly;
    lucidaOnly.withText(QStringLiteral("LUCON.ttf"), "l").withText(QStringLiteral("xlucon.TTF"), "x");
    const FontFolder none;
    FontFolder folderOfThatName;
    ASSERT_TRUE(QDir(folderOfThatName.path()).mkdir(gothic));

    struct Row
    {
        QStringList folders;
        QString expected; ///< path; empty: none
        bool isCollection;
        const char *reason;
    };
    const Row rows[] = {
        {{}, {}, false, "no folder"},
        {{none.path()}, {}, false, "an empty folder"},
        {{QStringLiteral("/no/such folder")}, {}, false, "a folder that does not exist"},
        {{folderOfThatName.path()}, {}, false, "a folder of that name is not a file"},
        {{both.path()}, both.path() + u'/' + gothic, true, "the Gothic face before the other"},
        {{lucidaOnly.path()}, lucidaOnly.path() + QStringLiteral("/LUCON.ttf"), false, "case does not matter"},
        {{lucidaOnly.path(), gothicOnly.path()},
         gothicOnly.path() + QStringLiteral("/msgothic.ttc"),
         true,
         "the Gothic face first, in whichever folder it is"},
        {{none.path(), both.path(), gothicOnly.path()}, both.path() + u'/' + gothic, true, "the first folder counts"},
    };
    for (const Row &row : rows) {
        const auto face = preferredPdfFace(row.folders);
        EXPECT_EQ(face ? face->file() : QString(), row.expected) << row.reason;
        if (face) {
            EXPECT_EQ(face->isCollection(), row.isCollection) << row.reason;
            EXPECT_EQ(face->index(), 0U) << row.reason;
        }
    }
}

TEST(PdfFaces, AFontThatComesOrGoesIsSeen)
{
    FontFolder folder;
    const auto makeOld = [&folder] {
        // What has just changed is looked into each time.
        using namespace std::chrono_literals;
        std::filesystem::last_write_time(folder.path().toStdString(),
                                         std::filesystem::file_time_type::clock::now() - 1h);
    };
    makeOld();
    EXPECT_FALSE(preferredPdfFace({folder.path()}));
    folder.with(QStringLiteral("lucon.TTF"), dejaVuFile());
    ASSERT_TRUE(preferredPdfFace({folder.path()}));
    EXPECT_TRUE(preferredPdfFace({folder.path()})->covers(U'A'));
    makeOld();
    EXPECT_TRUE(preferredPdfFace({folder.path()})->covers(U'A'));
    // A file that is written over leaves its folder as it was.
    const QString file = QDir(folder.path()).filePath(QStringLiteral("lucon.TTF"));
    QFile content(file);
    ASSERT_TRUE(content.open(QIODevice::WriteOnly | QIODevice::Truncate));
    content.write("no font");
    content.close();
    ASSERT_TRUE(preferredPdfFace({folder.path()}));
    EXPECT_FALSE(preferredPdfFace({folder.path()})->covers(U'A'));
    ASSERT_TRUE(QFile::remove(file));
    EXPECT_FALSE(preferredPdfFace({folder.path()}));
}

TEST(PdfFaces, TheSystemsOwnAreInTheOrderOfPreference)
{
    QStringList files;
    for (const PdfFace &face : kareport::fixedPitchPdfFaces()) {
        EXPECT_TRUE(QFile::exists(face.file())) << face.file().toStdString();
        EXPECT_TRUE(face.covers(U'A')) << face.file().toStdString();
        EXPECT_EQ(face.isCollection(), face.file().endsWith(u".ttc"));
        files.append(face.file().section(u'/', -1));
    }
    const qsizetype deja = files.indexOf(QStringLiteral("DejaVuSansMono.ttf"));
    const qsizetype liberation = files.indexOf(QStringLiteral("LiberationMono-Regular.ttf"));
    const qsizetype wqy = files.indexOf(QStringLiteral("wqy-zenhei.ttc"));
    EXPECT_EQ(deja, 0);
    EXPECT_GT(liberation, deja) << "the upright regular one";
    EXPECT_GT(wqy, liberation) << "CJK last";
    EXPECT_FALSE(kareport::systemFontFolders().isEmpty());
}

TEST(PdfFaces, TheFirstThatHasPlainTextComesFirst)
{
    const PdfFace deja = dejaVu();
    const PdfFace wqy = zenHei();
    FontFolder folder;
    folder.withText(QStringLiteral("bad.ttf"), "no font");
    const PdfFace bad(QDir(folder.path()).filePath(QStringLiteral("bad.ttf")), 0, false);
    struct Row
    {
        std::optional<PdfFace> preferred;
        std::vector<PdfFace> others;
        QStringView expected;
        const char *reason;
    };
    const Row rows[] = {
        {{}, {}, u"", "no face at all"},
        {{}, {deja, wqy}, u"DejaVuSansMono wqy-zenhei", "both have plain text: as they are"},
        {{}, {wqy, deja}, u"wqy-zenhei DejaVuSansMono", "both have plain text: as they are"},
        {{}, {bad, wqy, deja}, u"wqy-zenhei bad DejaVuSansMono", "what has no letters makes no grid"},
        {{}, {bad}, u"bad", "none has plain text: as they are"},
        {wqy, {deja, wqy}, u"wqy-zenhei DejaVuSansMono wqy-zenhei", "the preferred one before all"},
        {bad, {deja, wqy}, u"bad DejaVuSansMono wqy-zenhei", "it comes first whatever it covers"},
        {deja, {}, u"DejaVuSansMono", "there is no other"},
    };
    for (const Row &row : rows) {
        QStringList files;
        for (const PdfFace &face : kareport::orderPdfFaces(row.preferred, row.others)) {
            files.append(face.file().section(u'/', -1).section(u'.', 0, 0));
        }
        EXPECT_EQ(files.join(u' '), row.expected) << row.reason;
    }
}

} // namespace

#include "PdfFixture.h"

#include <gtest/gtest.h>

namespace
{

using kareport::CharacterCount;
using kareport::choosePdfFaces;
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

TEST(PdfFaces, AFileThatIsNoFontCoversNothing)
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
        {{folderOfThatName.path()}, {}, false, "a folder of that name is no file"},
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

std::vector<CharacterCount> countsOf(const char32_t *characters)
{
    std::vector<CharacterCount> counts;
    for (; *characters != 0; ++characters) {
        counts.push_back({*characters, 1});
    }
    return counts;
}

TEST(PdfFaces, TheFirstThatShowsMostIsTaken)
{
    const PdfFace deja = dejaVu();
    const PdfFace wqy = zenHei();
    FontFolder folder;
    folder.withText(QStringLiteral("bad.ttf"), "no font");
    const PdfFace bad(QDir(folder.path()).filePath(QStringLiteral("bad.ttf")), 0, false);
    const auto filesOf = [](const std::vector<PdfFace> &faces) {
        QStringList files;
        for (const PdfFace &face : faces) {
            files.append(face.file().section(u'/', -1).section(u'.', 0, 0));
        }
        return files.join(u' ');
    };
    struct Row
    {
        std::optional<PdfFace> preferred;
        std::vector<PdfFace> others;
        const char32_t *characters;
        QStringView expected;
        const char *reason;
    };
    const Row rows[] = {
        {{}, {}, U"A", u"", "no face at all"},
        {{}, {deja, wqy}, U"", u"DejaVuSansMono", "nothing is written: the first"},
        {{}, {deja, wqy}, U"Aé", u"DejaVuSansMono", "both have all: the first"},
        {{}, {wqy, deja}, U"Aé", u"wqy-zenhei", "both have all: the first"},
        {{}, {deja, wqy}, U"A測", u"wqy-zenhei", "the one that has all"},
        {{}, {deja, wqy}, U"A⧫測量", u"wqy-zenhei DejaVuSansMono", "the second has what the first lacks"},
        {{}, {deja, wqy}, U"A⧫⦇測", u"DejaVuSansMono wqy-zenhei", "the one that has most stands first"},
        {{}, {deja, wqy}, U"A😀", u"DejaVuSansMono", "what nobody has calls for nobody"},
        {{}, {deja, wqy}, U"😀", u"DejaVuSansMono", "what nobody has still needs a face for its sign"},
        {deja, {deja, wqy}, U"A", u"DejaVuSansMono", "the preferred one has all"},
        {deja, {deja, wqy}, U"A測", u"DejaVuSansMono wqy-zenhei", "it stands first, the others help out"},
        {deja, {}, U"A測", u"DejaVuSansMono", "nobody helps out"},
        {wqy, {deja, wqy}, U"Aé", u"wqy-zenhei", "it stands first for pure ASCII, too"},
        {wqy, {deja, wqy}, U"", u"wqy-zenhei", "nothing is written"},
        {bad, {deja, wqy}, U"A", u"bad DejaVuSansMono", "it stands first whatever it covers"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(filesOf(choosePdfFaces(row.preferred, row.others, countsOf(row.characters))), row.expected)
            << row.reason;
    }
    EXPECT_EQ(filesOf(choosePdfFaces({}, {deja, wqy}, {{U'⧫', 1}, {U'測', 2}})), u"wqy-zenhei DejaVuSansMono")
        << "occurrences count, not characters";
}

} // namespace

#include "Xlate.h"

#include "PrintQt.h"

#include <QCoreApplication>
#include <QStringList>
#include <QTranslator>

#include <gtest/gtest.h>

namespace
{

struct Row
{
    const char *text;
    QStringView expected;
    const char *reason;
};

TEST(Xlate, WithoutATranslationGivesTheTextWithoutItsNote)
{
    constexpr Row rows[] = {
        {"", u"", "empty"},
        {"Station", u"Station", "no note"},
        {"Report@@caption of the pane", u"Report", "the note is never shown"},
        {"Report @@ note", u"Report ", "only what follows the mark goes"},
        {"Report@@", u"Report", "an empty note"},
        {"@@note", u"", "nothing but a note"},
        {"@@", u"", "nothing at all"},
        {"a@b.c", u"a@b.c", "one at sign is text"},
        {"a@", u"a@", "one at sign at the end"},
        {"a@@@b", u"a", "the first mark counts"},
        {"a@@b@@c", u"a", "a second mark belongs to the note"},
        {"Größe 測量 😀@@ä", u"Größe 測量 😀", "UTF-8"},
        {"%1 of %n@@%2", u"%1 of %n", "places for numbers stay as they are"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(Xlate(row.text), row.expected.toString()) << row.reason;
    }
}

/// Knows three texts and keeps what it was asked.
class Translator : public QTranslator
{
public:
    Translator() { QCoreApplication::installTranslator(this); }
    ~Translator() override { QCoreApplication::removeTranslator(this); }

    QString translate(const char * /*context*/, const char *text, const char *note, int /*number*/) const override
    {
        asked.append(QString::fromUtf8(text) + u'|' +
                     (note == nullptr ? QStringLiteral("-") : QString::fromUtf8(note)));
        if (qstrcmp(text, "Station") == 0) {
            return QStringLiteral("測站");
        }
        if (qstrcmp(text, "Report") == 0) {
            return qstrcmp(note, "a verb") == 0 ? QStringLiteral("Berichten") : QStringLiteral("Bericht");
        }
        return {};
    }
    bool isEmpty() const override { return false; }

    mutable QStringList asked;
};

TEST(Xlate, GivesTheTranslationThatIsInstalled)
{
    {
        const Translator translator;
        constexpr Row rows[] = {
            {"Station", u"測站", "no note"},
            {"Report@@a noun", u"Bericht", "with a note"},
            {"Report@@a verb", u"Berichten", "the note tells texts of the same words apart"},
            {"Report", u"Bericht", "the same without a note"},
            {"Other", u"Other", "a text that the language lacks"},
            {"Other@@a note", u"Other", "a text that the language lacks, with a note"},
            {"report@@a verb", u"report", "case matters"},
        };
        for (const Row &row : rows) {
            EXPECT_EQ(Xlate(row.text), row.expected.toString()) << row.reason;
        }
    }
    EXPECT_EQ(Xlate("Station"), QStringLiteral("Station")) << "the language has gone";
}

TEST(Xlate, AsksForTheTextWithItsNote)
{
    struct AskedRow
    {
        const char *text;
        QStringView expected;
        const char *reason;
    };
    constexpr AskedRow rows[] = {
        {"Station", u"Station|-", "no note"},
        {"Report@@a verb", u"Report|a verb", "text and note"},
        {"Report@@ a@@b ", u"Report| a@@b ", "all of the note"},
        {"Größe@@für Flächen", u"Größe|für Flächen", "UTF-8"},
    };
    const Translator translator;
    for (const AskedRow &row : rows) {
        translator.asked.clear();
        Xlate(row.text);
        EXPECT_EQ(translator.asked.value(0), row.expected.toString()) << row.reason;
    }
}

} // namespace

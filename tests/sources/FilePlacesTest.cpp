#include "FilePlaces.h"
#include "InputErrorText.h"

#include <gtest/gtest.h>

namespace
{

using namespace kareport;

TEST(FilePlaces, AreOfLinesAndCharacters)
{
    struct Row
    {
        QByteArray file;
        std::size_t byte;
        const char *place;
    };
    const Row rows[] = {
        {"ab\ncd", 0, "1:1"},
        {"ab\ncd", 2, "1:3"},
        {"ab\ncd", 3, "2:1"},
        {"ab\ncd", 99, "2:3"},
        {"\xEF\xBB\xBF"
         "ab",
         4, "1:2"},
        {"\xC3\xA4\xF0\x9D\x84\x9E"
         "b",
         6, "1:3"},
        {QByteArray("\xFF\xFE"
                    "a\0\n\0b\0c\0",
                    10),
         8, "2:2"},
        {QByteArray("\xFE\xFF"
                    "\0a\xD8\x34\xDD\x1E\0b",
                    10),
         8, "1:3"},
        {"<?xml version='1.0' encoding='windows-1252'?>\n\x84\x93x", 48, "2:3"},
        {"<?xml version=\"1.0\" encoding=\"ISO-8859-1\"?>\n\xA0\xBFx", 46, "2:3"},
        {"<?xml version='1.0' encoding='UTF-8'?>\n\xC3\x84x", 41, "2:2"},
        {"<?xml version='1.0'?>\n\xC3\x84x", 24, "2:2"},
    };
    for (const Row &row : rows) {
        const auto file = FileBytes::holding(QString(), row.file);
        const TextPlace place = FilePlaces(*file).of(row.byte);
        EXPECT_EQ(placeText(place), QString::fromLatin1(row.place)) << row.file.toHex().constData() << " " << row.byte;
    }
}

TEST(FilePlaces, AreTheSameInAnyOrderAndAcrossBlocks)
{
    QByteArray text;
    for (int i = 0; text.size() < 300000; ++i) {
        text += QByteArray(i % 97, 'x') + "\xC3\xA4" + (i % 5 == 0 ? "" : "\n");
    }
    QByteArray wide("\xFF\xFE");
    for (const QChar unit : QString::fromUtf8(text)) {
        wide += static_cast<char>(unit.unicode() & 0xFFU);
        wide += static_cast<char>(unit.unicode() >> 8U);
    }
    for (const QByteArray &content : {text, wide}) {
        const auto file = FileBytes::holding(QString(), content);
        FilePlaces inTurn(*file);
        for (std::size_t byte = 0; byte < std::size_t(content.size()); byte += 9972) {
            const QString alone = placeText(FilePlaces(*file).of(byte));
            EXPECT_EQ(placeText(inTurn.of(byte)), alone) << byte;
            if (byte > 20000) {
                inTurn.of(byte - 20000); // and back
                EXPECT_EQ(placeText(inTurn.of(byte)), alone) << byte;
            }
        }
    }
    const auto file = FileBytes::holding(QString(), text);
    const QByteArray before = text.first(250000);
    EXPECT_EQ(FilePlaces(*file).of(250000).line, before.count('\n') + 1);
    EXPECT_EQ(FilePlaces(*file).of(250000).column,
              QString::fromUtf8(before.sliced(before.lastIndexOf('\n') + 1)).size() + 1);
}

} // namespace

#include "RichTextCodePage.h"

#include "Windows1252.h"

#include <QChar>

#include <algorithm>
#include <iterator>

namespace kareport
{

namespace
{

constexpr int westernCodePage = 1252;

struct NumberRow
{
    int number;
    const char *name;
};

constexpr NumberRow pageNames[] = {{437, "IBM437"},          {720, "IBM720"},
                                   {737, "IBM737"},          {775, "IBM775"},
                                   {850, "IBM850"},          {852, "IBM852"},
                                   {855, "IBM855"},          {857, "IBM857"},
                                   {858, "IBM858"},          {860, "IBM860"},
                                   {861, "IBM861"},          {862, "IBM862"},
                                   {863, "IBM863"},          {864, "IBM864"},
                                   {865, "IBM865"},          {866, "IBM866"},
                                   {869, "IBM869"},          {874, "windows-874"},
                                   {932, "windows-31j"},     {936, "windows-936"},
                                   {949, "windows-949"},     {950, "windows-950"},
                                   {1250, "windows-1250"},   {1251, "windows-1251"},
                                   {1253, "windows-1253"},   {1254, "windows-1254"},
                                   {1255, "windows-1255"},   {1256, "windows-1256"},
                                   {1257, "windows-1257"},   {1258, "windows-1258"},
                                   {10000, "macintosh"},     {10001, "windows-31j"},
                                   {10002, "windows-950"},   {10003, "windows-949"},
                                   {10006, "x-mac-greek"},   {10007, "x-mac-cyrillic"},
                                   {10008, "windows-936"},   {10029, "x-mac-centraleurroman"},
                                   {10081, "x-mac-turkish"}, {20866, "KOI8-R"},
                                   {21866, "KOI8-U"},        {54936, "GB18030"},
                                   {65001, "UTF-8"}};

struct CharsetRow
{
    int charset;
    int codePage;
};

constexpr CharsetRow charsets[] = {{0, 1252},   {2, symbolCodePage}, {77, 10000}, {78, 10001}, {79, 10003}, {80, 10008},
                                   {81, 10002}, {83, 10006},         {85, 10081}, {88, 10029}, {89, 10007}, {128, 932},
                                   {129, 949},  {134, 936},          {136, 950},  {161, 1253}, {162, 1254}, {163, 1258},
                                   {177, 1255}, {178, 1256},         {186, 1257}, {204, 1251}, {222, 874},  {238, 1250},
                                   {254, 437},  {255, 850}};

constexpr bool isMultiByte(int number)
{
    constexpr int numbers[] = {932, 936, 949, 950, 10001, 10002, 10003, 10008, 54936, 65001};
    return std::find(std::begin(numbers), std::end(numbers), number) != std::end(numbers);
}

} // namespace

RichTextCodePage::RichTextCodePage(int number)
{
    for (std::size_t byte = 0; byte < table_.size(); ++byte) {
        table_[byte] = static_cast<char16_t>(byte);
    }
    for (std::size_t i = 0; i < windows1252.size(); ++i) {
        if (windows1252[i] != 0) {
            table_[0x80 + i] = windows1252[i];
        }
    }
    if (number == symbolCodePage) {
        // What the sign of a font is, is known where the font is. Letters stay: many fonts that say to hold signs hold
        // letters.
        for (std::size_t byte = 0x80; byte < table_.size(); ++byte) {
            table_[byte] = static_cast<char16_t>(0xF000 + byte);
        }
        return;
    }
    const auto *row = std::find_if(std::begin(pageNames), std::end(pageNames),
                                   [number](const NumberRow &candidate) { return candidate.number == number; });
    if (row == std::end(pageNames)) {
        return;
    }
    decoder_ = QStringDecoder(row->name);
    if (!decoder_.isValid()) {
        return;
    }
    singleByte_ = !isMultiByte(number);
    if (!singleByte_) {
        return;
    }
    for (std::size_t byte = 0x80; byte < table_.size(); ++byte) {
        const char bytes[] = {static_cast<char>(byte)};
        const QString text = decode(QByteArrayView(bytes, 1));
        table_[byte] = text.size() == 1 ? text.front().unicode() : char16_t(QChar::ReplacementCharacter);
    }
}

QString RichTextCodePage::decode(QByteArrayView bytes)
{
    QString text = decoder_(bytes);
    decoder_.resetState();
    // Some converters put SUB where nothing fits.
    text.replace(QChar(0x1A), QChar(QChar::ReplacementCharacter));
    return text;
}

RichTextCodePage &RichTextCodePages::page(int number)
{
    // Unknown numbers share one page, however many a file makes up.
    const bool known =
        number == symbolCodePage || std::any_of(std::begin(pageNames), std::end(pageNames),
                                                [number](const NumberRow &row) { return row.number == number; });
    auto &page = pages_[known ? number : westernCodePage];
    if (!page) {
        page = std::make_unique<RichTextCodePage>(known ? number : westernCodePage);
    }
    return *page;
}

int codePageOfCharset(int charset)
{
    for (const CharsetRow &row : charsets) {
        if (row.charset == charset) {
            return row.codePage;
        }
    }
    return 0;
}

} // namespace kareport

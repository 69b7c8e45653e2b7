#include "JsonText.h"

#include <QJsonArray>
#include <QJsonDocument>

#include <gtest/gtest.h>

namespace
{

std::string jsonOf(QStringView text)
{
    std::string out;
    kareport::appendJsonText(out, text);
    return out;
}

TEST(JsonText, WhatWouldEndOrChangeATextIsEscaped)
{
    EXPECT_EQ(jsonOf(u""), R"("")");
    EXPECT_EQ(jsonOf(u"plain"), R"("plain")");
    EXPECT_EQ(jsonOf(u"a\"b\\c"), R"("a\"b\\c")");
    EXPECT_EQ(jsonOf(u"1\n2\r3\t4"), R"("1\n2\r3\t4")");
    EXPECT_EQ(jsonOf(u"\u0001\u001f"), R"("\u0001\u001f")");
    EXPECT_EQ(jsonOf(u"</script>"), R"("</script>")") << "it is not part of a page";
    EXPECT_EQ(jsonOf(u"\u00e4\u2028"), "\"\xC3\xA4\xE2\x80\xA8\"");
}

TEST(JsonText, EveryCharacterIsReadBack)
{
    QString all;
    for (char32_t code = 0; code < 0x11000; code += code < 0x300 ? 1 : 37) {
        if (code < 0xD800 || code > 0xDFFF) {
            all += QString::fromUcs4(&code, 1);
        }
    }
    const std::string json = '[' + jsonOf(all) + ']';
    QJsonParseError error{};
    const QJsonDocument document = QJsonDocument::fromJson(QByteArray::fromStdString(json), &error);
    ASSERT_EQ(error.error, QJsonParseError::NoError) << error.errorString().toStdString();
    EXPECT_EQ(document.array().at(0).toString(), all);
}

} // namespace

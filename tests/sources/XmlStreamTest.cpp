#include "XmlStream.h"
#include "InputErrorText.h"
#include "JobFolder.h"

#include <gtest/gtest.h>

#include <stdexcept>

namespace
{

using namespace kareport;

/// Records its notifications.
class Listener : public XmlHandler
{
public:
    Interest startElement(std::string_view name, const XmlAttributes &attributes) override
    {
        heard += '<' + std::string(name);
        for (const char *const *pair = attributes.pairs(); *pair != nullptr; pair += 2) {
            heard += std::string_view(pair[0]).starts_with("xmlns") ? "" : std::string(" ") + pair[0] + '=' + pair[1];
        }
        heard += '>';
        if (name == "throw") {
            throw std::runtime_error("thrown");
        }
        if (name == "skip") {
            return Interest::None;
        }
        if (name == "left") {
            return Interest::LeftOut;
        }
        return name == "parts" ? Interest::Parts : Interest::Text;
    }
    void endElement() override { heard += "</>"; }
    void text(std::string_view piece) override { heard += piece; }
    void foreignElement(std::string_view name) override { heard += '{' + std::string(name) + '}'; }
    void leftOutElements(std::string_view name, std::size_t count) override
    {
        leftOut += std::string(name) + ' ' + std::to_string(count) + ' ';
    }

    std::string heard;
    std::string leftOut;
};

/// A file that has been read to its end.
struct Read
{
    explicit Read(const QByteArray &content)
    {
        folder.put("file.xml", content);
        auto opened = FileBytes::open(folder.path("file.xml"));
        XmlStream stream(std::get<std::shared_ptr<const FileBytes>>(opened), listener);
        while (stream.readSome()) {
        }
        error = stream.error();
    }

    JobFolder folder;
    Listener listener;
    std::optional<InputError> error;
};

TEST(XmlStream, TellsElementsAttributesAndTexts)
{
    const Read read("<a x='1' y=\"&lt;\">t&#65;<b/>u<skip z='2'><c>v</c></skip><parts>gone<d>w</d></parts></a>");
    EXPECT_FALSE(read.error);
    EXPECT_EQ(read.listener.heard, "<a x=1 y=<>tA<b></>u<skip z=2><parts><d>w</></></>")
        << "what is in \"skip\", and the text in \"parts\", are not asked for";
}

TEST(XmlStream, TheVocabularyIsThatOfTheOutermostElementWhateverItsPrefixIs)
{
    struct Row
    {
        const char *content;
        const char *heard;
        const char *reason;
    };
    const Row rows[] = {
        {"<a><b/></a>", "<a><b></></>", "none"},
        {"<a xmlns='u'><b/></a>", "<a><b></></>", "without a prefix"},
        {"<l:a xmlns:l='u'><l:b/></l:a>", "<a><b></></>", "with one"},
        {"<l:a><l:b/></l:a>", "<a><b></></>", "with one that is not declared"},
        {"<l:a xmlns:m='u' xmlns:l='u'><m:b/></l:a>", "<a><b></></>", "with two for the same"},
        {"<l:a xmlns:l='u' xmlns='v'><b/><l:b/></l:a>", "<a>{b}<b></></>", "another vocabulary without prefix"},
        {"<a xmlns='u' xmlns:x='v'><x:b><c/></x:b><b/></a>", "<a>{x:b}<b></></>",
         "what is in a foreign element is its own"},
        {"<a xmlns='u'><b xmlns='v'><c/></b><b/></a>", "<a>{b}<b></></>", "changed for an element, and back after it"},
        {"<a xmlns='u'><skip xmlns='u'><c xmlns='v'/></skip><b/></a>", "<a><skip><b></></>", "in what is skipped"},
        {"<a><x:b/></a>", "<a>{x:b}</>", "a prefix that is not declared"},
    };
    for (const Row &row : rows) {
        const Read read(row.content);
        EXPECT_FALSE(read.error) << row.reason;
        EXPECT_EQ(read.listener.heard, row.heard) << row.reason;
    }
}

TEST(XmlStream, ReadsTheEncodingsOfPrograms)
{
    const auto utf16 = [](const QString &text, bool isLittle) {
        QByteArray bytes = isLittle ? "\xFF\xFE" : "\xFE\xFF";
        for (const QChar unit : text) {
            const char low = static_cast<char>(unit.unicode() & 0xFFU);
            const char high = static_cast<char>(unit.unicode() >> 8U);
            bytes += isLittle ? low : high;
            bytes += isLittle ? high : low;
        }
        return bytes;
    };
    const QByteArray files[] = {
        "<a>\xC3\xA4\xE2\x82\xAC</a>",
        "\xEF\xBB\xBF<a>\xC3\xA4\xE2\x82\xAC</a>",
        "<?xml version='1.0' encoding='windows-1252'?><a>\xE4\x80</a>",
        "<?xml version='1.0' encoding='CP1252'?><a>\xE4\x80</a>",
        utf16(QStringLiteral("<a>ä€</a>"), true),
        utf16(QStringLiteral("<a>ä€</a>"), false),
    };
    for (const QByteArray &file : files) {
        const Read read(file);
        EXPECT_FALSE(read.error) << file.constData() << ": " << textOfError(read.error).toStdString();
        EXPECT_EQ(read.listener.heard, "<a>\xC3\xA4\xE2\x82\xAC</>") << file.constData();
    }
    EXPECT_EQ(Read("<?xml version='1.0' encoding='ISO-8859-1'?><a>\xE4</a>").listener.heard, "<a>\xC3\xA4</>");
}

TEST(XmlStream, EveryMistakeHasItsPlace)
{
    struct Row
    {
        const char *content;
        const char *place;
        const char *contains;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"", "1:1", "not well-formed XML", "an empty file"},
        {"northing,easting\n1,2\n", "1:1", "not well-formed XML", "a file of another kind"},
        {"<a>\n <b>\n </c></a>", "3:4", "not well-formed XML", "an end that does not match"},
        {"<a>\n<b>", "2:4", "not well-formed XML", "cut off"},
        {"<a>\n\xC3\xA4<b x=1/></a>", "2:7", "not well-formed XML", "columns count characters"},
        {"<a>\n\xFF</a>", "2:1", "not well-formed XML", "not UTF-8"},
        {"<?xml version='1.0' encoding='Shift_JIS'?><a/>", "1:31", "encoding", "an encoding that is not known"},
        {"<!DOCTYPE a [\n<!ENTITY x 'y'>]><a>&x;</a>", "2:12", "\"x\"", "an entity: its declaration has ended"},
        {"<!DOCTYPE a [<!ENTITY x SYSTEM 'file:///etc/passwd'>]>\n<a>&x;</a>", "1:52", "\"x\"", "one of another file"},
        {"<!DOCTYPE a [<!ENTITY % x SYSTEM 'file:///etc/passwd'>]>\n<a/>", "1:54", "\"x\"", "one of the declaration"},
        {"<!DOCTYPE a SYSTEM 'other.dtd'>\n<a>&x;</a>", "1:31", "\"other.dtd\"", "one that another file would declare"},
        {"<!DOCTYPE a PUBLIC 'x' 'other.dtd' [\n<!ATTLIST a b CDATA '1'>]><a/>", "1:36", "\"other.dtd\"",
         "a document type in another file, and more of it in this one"},
        {"<a>\n&x;</a>", "2:1", "not well-formed XML", "one that is not declared"},
    };
    for (const Row &row : rows) {
        const Read read(row.content);
        ASSERT_TRUE(read.error) << row.reason;
        EXPECT_EQ(placeText(read.error), QString::fromLatin1(row.place)) << row.reason;
        EXPECT_TRUE(read.error->text.contains(QString::fromLatin1(row.contains)))
            << row.reason << ": " << read.error->text.toStdString();
        EXPECT_EQ(read.error->file, read.folder.path("file.xml")) << row.reason;
    }
}

TEST(XmlStream, OtherFilesAreNotOpened)
{
    JobFolder folder;
    folder.put("other.dtd", "<!ENTITY x 'secret'>");
    const Read read("<!DOCTYPE a SYSTEM 'file://" + QFile::encodeName(folder.path("other.dtd")) + "'><a>&x;</a>");
    ASSERT_TRUE(read.error);
    EXPECT_EQ(read.listener.heard.find("secret"), std::string::npos);
}

TEST(XmlStream, FilesThatWouldTakeAllMemoryAreRefused)
{
    QByteArray laughs = "<!DOCTYPE a [<!ENTITY l0 'ha'>";
    for (int i = 1; i < 12; ++i) {
        laughs +=
            "<!ENTITY l" + QByteArray::number(i) + " '" + ("&l" + QByteArray::number(i - 1) + ';').repeated(10) + "'>";
    }
    struct Row
    {
        QByteArray content;
        const char *contains;
        const char *reason;
    };
    const Row rows[] = {
        {laughs + "]><a>&l11;</a>", "entity", "a billion laughs"},
        {"<a>" + QByteArray("<b>").repeated(1000000), "nested", "a million elements in each other"},
        {"<a>" + QByteArray("<skip>").repeated(1000000), "nested", "in what is skipped"},
        {"<a x='" + QByteArray(20 << 20, 'x') + "'/>", "tag", "a value of twenty million characters"},
        {"<a " + QByteArray(20 << 20, ' ') + "/>", "tag", "a tag of blanks"},
        {"<a><!--" + QByteArray(20 << 20, '-'), "XML", "a comment that does not end"},
    };
    for (const Row &row : rows) {
        const Read read(row.content);
        ASSERT_TRUE(read.error) << row.reason;
        EXPECT_TRUE(read.error->text.contains(QString::fromLatin1(row.contains)))
            << row.reason << ": " << read.error->text.toStdString();
        EXPECT_LT(read.listener.heard.size(), 1000U) << row.reason;
    }
    EXPECT_FALSE(Read(QByteArray("<a>").repeated(100) + QByteArray("</a>").repeated(100)).error)
        << "as deep as allowed";
}

TEST(XmlStream, TextsAreToldInPiecesOfAnySize)
{
    const QByteArray text = QByteArray("0123456789").repeated(50000);
    const Read read("<a>" + text + "</a>");
    EXPECT_EQ(read.listener.heard, "<a>" + text.toStdString() + "</>");
}

TEST(XmlStream, WhatTheHandlerThrowsIsThrownOn)
{
    EXPECT_THROW(Read("<a><throw/></a>"), std::runtime_error);
}

TEST(XmlStream, TextAfterAnElementBelongsToTheOneAroundIt)
{
    EXPECT_EQ(Read("<a>1<b>2<skip>3</skip>4<parts>5<c>6</c>7</parts>8</b>9</a>").listener.heard,
              "<a>1<b>2<skip>4<parts><c>6</></>8</>9</>");
    EXPECT_EQ(Read("<a xmlns='u'>1<x xmlns='v'>2</x>3</a>").listener.heard, "<a>1{x}3</>");
}

TEST(XmlStream, ADocumentTypeInTheFileItselfIsRead)
{
    const Read read("<!DOCTYPE a [<!ELEMENT a ANY>]><a>1</a>");
    EXPECT_FALSE(read.error);
    EXPECT_EQ(read.listener.heard, "<a>1</>");
}

TEST(XmlStream, APrefixIsFoundAmongMany)
{
    QByteArray content = "<a xmlns='u'";
    for (int i = 0; i < 1000; ++i) {
        content += " xmlns:p" + QByteArray::number(i) + "='v'";
    }
    content += '>' + QByteArray("<b/><p7:c/>").repeated(1000) + "</a>";
    const Read read(content);
    EXPECT_FALSE(read.error);
    EXPECT_EQ(read.listener.heard, "<a>" + QByteArray("<b></>{p7:c}").repeated(1000).toStdString() + "</>");
}

TEST(XmlStream, ElementsInOneThatIsLeftOutAreToldByTheirNames)
{
    const Read read(
        "<p:r xmlns:p='urn:p' xmlns:q='urn:q'><p:left><p:a>x<p:b/><p:b/></p:a><q:c/></p:left><p:skip><p:d/></p:skip>"
        "<q:other><q:e/><p:f/></q:other><p:parts/></p:r>");
    EXPECT_EQ(read.listener.leftOut, "a 1 b 2 c 1 q:e 1 p:f 1 ");
    EXPECT_EQ(read.listener.heard, "<r><left><skip>{q:other}<parts></></>");
    EXPECT_FALSE(read.error);
}

} // namespace

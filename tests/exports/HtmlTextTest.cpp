#include "HtmlText.h"

#include <gtest/gtest.h>

namespace
{

std::string htmlOf(QStringView text)
{
    std::string out;
    kareport::appendHtmlText(out, text);
    return out;
}

TEST(HtmlText, NothingInATextIsMarkup)
{
    EXPECT_EQ(htmlOf(u"plain \u00e4"), "plain \xC3\xA4");
    EXPECT_EQ(htmlOf(u"<script>alert('x')</script>"), "&lt;script&gt;alert(&#39;x&#39;)&lt;/script&gt;");
    EXPECT_EQ(htmlOf(u"a&amp;\"b\""), "a&amp;amp;&quot;b&quot;");
    EXPECT_EQ(htmlOf(u"a\tb\nc\rd"), "a\tb\nc&#13;d");
    EXPECT_EQ(htmlOf(u"a\u0001b\u0085"), "a\xEF\xBF\xBD"
                                         "b\xEF\xBF\xBD")
        << "no page may have them";
}

} // namespace

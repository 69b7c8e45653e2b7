#include "ResultJob.h"

#include <gmock/gmock.h>

#include <QRegularExpression>

namespace
{

using jobs::ResultJob;
using jobs::templateJob;
using testing::HasSubstr;
using testing::Not;

std::string pageOf(const QByteArray &data, const QByteArray &steps, const QByteArray &more = {},
                   const QByteArray &output = R"("p.html")")
{
    ResultJob job;
    job.run(templateJob(data, steps, more) + R"(, "output": [)" + output + "]");
    return job.bytes("p.html");
}

/// The part of a page between the body's beginning and the script.
std::string bodyOf(const std::string &page)
{
    const std::size_t start = page.find("<body>\n") + 7;
    return page.substr(start, page.find("<script>") - start);
}

const char *const points =
    R"("p": {"values": [{"Number": "<b>1</b>", "Northing": 12.5}, {"Number": "2A", "Northing": -7}]})";

TEST(HtmlResult, TheReportIsOnePage)
{
    const std::string page = pageOf(points, R"({"heading": "Setting out"}, {"line": "x < y", "style": 3}, {"line": ""},
        {"table": "Points", "data": "p"}, {"line": "the end"})",
                                    R"("title": "A & B", )");
    EXPECT_THAT(page, HasSubstr("<!DOCTYPE html>\n<html>\n<head>\n<meta charset=\"utf-8\">"));
    EXPECT_THAT(page, HasSubstr("<title>A &amp; B</title>"));
    EXPECT_EQ(bodyOf(page), R"(<h1>A &amp; B</h1>
<p class="made">TALVEN, <time datetime="2024-03-05T14:07:00">2024-03-05 14:07</time></p>
<h2>Setting out</h2>
<p><b><u>x &lt; y</u></b></p>
<table class="data">
<caption>Points</caption>
<thead>
<tr><th scope="col"><span>Pt</span></th><th scope="col" class="n"><span>North</span></th></tr>
</thead>
<tbody class="d">
<tr><td>&lt;b&gt;1&lt;/b&gt;</td><td class="n">12.500</td></tr>
<tr><td>2A</td><td class="n">-7.000</td></tr>
</tbody>
</table>
<p>the end</p>
)");
    EXPECT_THAT(page, HasSubstr("</script>\n</body>\n</html>\n"));
}

TEST(HtmlResult, NothingComesFromElsewhere)
{
    const std::string page = pageOf(points, R"({"table": "Points", "data": "p"})");
    EXPECT_THAT(page, HasSubstr("default-src 'none'; style-src 'sha256-"));
    EXPECT_THAT(page, Not(HasSubstr("unsafe-inline")));
    EXPECT_THAT(page, Not(HasSubstr("http:")));
    EXPECT_THAT(page, Not(HasSubstr("https:")));
    EXPECT_THAT(page, Not(HasSubstr("src=")));
    EXPECT_THAT(page, HasSubstr("prefers-color-scheme:dark"));
    EXPECT_THAT(page, HasSubstr("thead{display:table-header-group}")) << "the heading is on every sheet of paper";
}

TEST(HtmlResult, ABlockHasARowForEachOfItsLines)
{
    const std::string body = bodyOf(
        pageOf(R"("s": {"values": {"Client": "Harbour Board", "Area": 12.5}})", R"({"block": "Site", "data": "s"})"));
    EXPECT_THAT(body, HasSubstr(R"(<table class="block" aria-label="Site">
<tbody>
<tr><th scope="row">Client</th><td>Harbour Board</td></tr>
<tr><th scope="row">Area</th><td>12.500</td></tr>
</tbody>
</table>
)")) << "the bearing is missing";
}

TEST(HtmlResult, WhatIsNoPlainNumberSaysWhatItIsSortedBy)
{
    const std::string body = bodyOf(pageOf(R"("p": {"values": [{"Chainage": 12345.678}, {"Chainage": 5}]})",
                                           R"({"table": "Stations", "data": "p"})"));
    EXPECT_THAT(body, HasSubstr(R"(<th scope="col" class="n"><span>Station</span></th>)")) << "the chainage label";
    EXPECT_THAT(body, HasSubstr(R"(<td class="n" data-v="12345.678">12+345.678</td>)"));
    EXPECT_THAT(body, HasSubstr(R"(<td class="n" data-v="5">0+005.000</td>)"));
}

QByteArray manyPoints(int count)
{
    QByteArray rows;
    for (int i = 1; i <= count; ++i) {
        rows += (i == 1 ? "" : ",") + QByteArray(R"({"Number": ")") + QByteArray::number(i) + R"(", "Northing": 1})";
    }
    return R"("p": {"values": [)" + rows + "]}";
}

TEST(HtmlResult, ALongTableGoesOnInFurtherPages)
{
    ResultJob job;
    const auto run = [&job](int rows) {
        job.run(templateJob(manyPoints(rows), R"({"table": "Points", "data": "p"}, {"line": "the end"})",
                            R"("title": "T", )") +
                R"(, "output": [{"file": "a b.html", "rowsPerPage": 3}])");
        return job.bytes("a b.html");
    };
    const auto count = [](const std::string &page, const char *text) {
        return QString::fromStdString(page).count(QString::fromUtf8(text));
    };
    EXPECT_EQ(count(run(3), "<!DOCTYPE html>"), 1) << "three rows fit";
    const std::string all = run(7);
    EXPECT_EQ(count(all, "<!DOCTYPE html>"), 3);
    EXPECT_EQ(count(all, "</html>"), 3);
    EXPECT_EQ(count(all, "<table"), 3);
    EXPECT_EQ(count(all, "</table>"), 3);
    EXPECT_EQ(count(all, "<thead>"), 3) << "under its heading again";
    EXPECT_EQ(count(all, "<caption>Points</caption>"), 3);
    EXPECT_EQ(count(all, "<h1>T</h1>"), 3);
    EXPECT_EQ(count(all, "the end"), 1);
    EXPECT_THAT(all, HasSubstr(R"(<a rel="next" href="a%20b-2.html">2 &rarr;</a>)"));
    EXPECT_THAT(all, HasSubstr(R"(<a rel="prev" href="a%20b.html">&larr; 1</a>)"));
    EXPECT_THAT(all, HasSubstr(R"(<a rel="next" href="a%20b-3.html">3 &rarr;</a>)"));
    EXPECT_THAT(all, HasSubstr(R"(<a rel="prev" href="a%20b-2.html">&larr; 2</a>)"));
}

TEST(HtmlResult, KeysOfThePage)
{
    const char *const steps = R"({"table": "Points", "data": "p"})";
    const std::string page = pageOf(points, steps, {}, R"({"file": "p.html", "title": "<Own>", "language": "pt-BR"})");
    EXPECT_THAT(page, HasSubstr("<html lang=\"pt-BR\">"));
    EXPECT_THAT(page, HasSubstr("<h1>&lt;Own&gt;</h1>"));
    EXPECT_THAT(pageOf(points, steps, {}, R"({"file": "p.html", "language": "d\""})"),
                HasSubstr("the tag of a language such as de or pt-BR was expected"));
    EXPECT_THAT(pageOf(points, steps, {}, R"({"file": "p.html", "rowsPerPage": 0})"),
                HasSubstr("a whole number from 1 to 1000000 was expected"));
    EXPECT_THAT(pageOf(points, steps, {}, R"({"file": "p.html", "tittle": "x"})"),
                HasSubstr("did you mean \"title\"?"));
}

TEST(HtmlResult, AnEmptyReportIsAPageToo)
{
    EXPECT_THAT(pageOf(points, ""), HasSubstr("<h1>Title</h1>"));
    EXPECT_THAT(pageOf(R"("p": {"values": []})", R"({"table": "Points", "data": "p"})"),
                HasSubstr("</thead>\n</table>\n"));
}

} // namespace

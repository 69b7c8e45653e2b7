#include "ResultJob.h"

#include <gmock/gmock.h>

namespace
{

using testing::HasSubstr;
using testing::Not;

/// Runs a job with a grouped table.
void runGrouped(jobs::ResultJob &job, const char *heading)
{
    const QByteArray step = QByteArray(R"({"table": "Points", "data": "p", "sort": "Number",
        "groups": [{"by": "Number", "heading": ")") +
                            heading + R"(", "totals": [{"label": "{count} rows", "sum": "Northing"}]}],
        "pageTotals": [{"label": "Page", "sum": "Northing"}], "totals": [{"label": "All", "mean": "Northing"}]})";
    job.run(jobs::templateJob(R"("p": {"values": [{"Number": "1", "Northing": 1}, {"Number": "2", "Northing": 4},
        {"Number": "1", "Northing": 2}, {"Number": "2"}]})",
                              step) +
            R"(, "output": ["p.html", "p.csv"])");
}

const char *const groupedRows = R"(</thead>
<tbody class="d">
<tr class="g"><th scope="rowgroup" colspan="2">Point 1</th></tr>
<tr><td>1</td><td class="n">1.000</td></tr>
<tr><td>1</td><td class="n">2.000</td></tr>
</tbody>
<tbody class="t">
<tr><td>2 rows</td><td class="n">3.000</td></tr>
</tbody>
<tbody class="d">
<tr class="g"><th scope="rowgroup" colspan="2">Point 2</th></tr>
<tr><td>2</td><td class="n">4.000</td></tr>
<tr><td>2</td><td class="n">0.000</td></tr>
</tbody>
<tbody class="t">
<tr><td>2 rows</td><td class="n">4.000</td></tr>
<tr><td>All</td><td class="n">2.333</td></tr>
</tbody>
</table>
)";

TEST(GroupResults, HeadingsAndTotalsAreRows)
{
    jobs::ResultJob job;
    runGrouped(job, "Point {Number}");
    EXPECT_THAT(job.bytes("p.html"), HasSubstr(groupedRows)) << "the pages of the report are none of the web page";
    EXPECT_THAT(job.bytes("p.csv"), HasSubstr("\n1,1\n1,2\n2,4\n2,\n"));
    EXPECT_THAT(job.bytes("p.csv"), Not(HasSubstr("All"))) << "data has no totals";
}

TEST(GroupResults, AHeadingWithTotalsComesBeforeItsRows)
{
    std::string expected = groupedRows;
    for (const auto &[from, to] : {std::pair<std::string, std::string>("Point 1<", "Point 1: 2 of 3.000<"),
                                   std::pair<std::string, std::string>("Point 2<", "Point 2: 2 of 4.000<")})
    {
        expected.replace(expected.find(from), from.size(), to);
    }
    jobs::ResultJob job;
    runGrouped(job, "Point {Number}: {count} of {sum:Northing}");
    EXPECT_THAT(job.bytes("p.html"), HasSubstr(expected));
    EXPECT_THAT(job.bytes("p.csv"), HasSubstr("\n1,1\n1,2\n2,4\n2,\n"));
}

/// The part of a page between two texts.
std::string between(const std::string &page, const char *first, const char *last)
{
    const std::size_t start = page.find(first);
    return start == std::string::npos ? std::string() : page.substr(start, page.find(last, start) - start);
}

TEST(GroupResults, APageThatTurnsRepeatsTheHeadingsOfItsGroups)
{
    jobs::ResultJob job;
    job.run(jobs::templateJob(R"("p": {"values": [{"Number": "1", "Northing": 1}, {"Number": "1", "Northing": 1},
        {"Number": "1", "Northing": 2}, {"Number": "2", "Northing": 4}]})",
                              R"({"table": "Points", "data": "p", "sort": ["Number", "Northing"],
        "groups": [{"by": "Number", "heading": "Point {Number}"}, {"by": "Northing", "heading": "at {Northing}"}]},
        {"table": "Sorted", "data": "p"})") +
            R"(, "output": [{"file": "p.html", "rowsPerPage": 1}])");
    std::vector<std::string> pages;
    const std::string all = job.bytes("p.html");
    for (std::size_t at = all.find("<body>"); at != std::string::npos; at = all.find("<body>", at + 1)) {
        pages.push_back(between(all.substr(at), "<h1>", "<script>"));
    }
    ASSERT_EQ(pages.size(), 8U) << "a row on each";
    EXPECT_THAT(pages[1],
                HasSubstr("Point 1</th></tr>\n<tr class=\"g\"><th scope=\"rowgroup\" colspan=\"2\">at 1.000</th>"));
    EXPECT_THAT(pages[2], HasSubstr("Point 1</th>")) << "the outer heading, with a new inner one";
    EXPECT_THAT(pages[2], Not(HasSubstr("at 1.000")));
    EXPECT_THAT(pages[2], HasSubstr("at 2.000"));
    EXPECT_THAT(pages[3], Not(HasSubstr("Point 1"))) << "a new outer group";
    for (std::size_t page = 4; page < pages.size(); ++page) {
        EXPECT_THAT(pages[page], Not(HasSubstr("Point"))) << "another table has no groups";
    }
    for (const std::string &page : pages) {
        const QString text = QString::fromStdString(page);
        EXPECT_EQ(text.count(QStringLiteral("<thead>")), 1)
            << "a heading of a table is not left without a row: " << page;
        EXPECT_EQ(text.count(QStringLiteral("<tbody class=\"d\">")), 1) << page;
    }
}

} // namespace

#include "CheckedTemplate.h"

QString changedTemplate(const char *was, const char *now)
{
    const QString piece = QString::fromUtf8(was);
    EXPECT_EQ(cleanTemplate.count(piece), 1) << was;
    QString text = cleanTemplate;
    return text.replace(piece, QString::fromUtf8(now));
}

std::vector<kareport::TextPlace> takeMarks(QString &text)
{
    std::vector<kareport::TextPlace> places;
    for (qsizetype at = text.indexOf(u'¦'); at >= 0; at = text.indexOf(u'¦')) {
        text.remove(at, 1);
        const QString before = text.first(at);
        const QString line = before.sliced(before.lastIndexOf(u'\n') + 1);
        places.push_back({before.count(u'\n') + 1, line.toUcs4().size() + 1});
    }
    return places;
}

void expectRemarks(QString text, const ExpectedRemarks &expected, const std::string &reason)
{
    const auto places = takeMarks(text);
    ASSERT_EQ(places.size(), expected.size()) << reason;
    const auto remarks = kareport::checkTemplates(kareport::TemplateFile(text.toUtf8()));
    std::string all;
    for (const auto &remark : remarks) {
        all += '\n' + std::to_string(remark.place.line) + ": " + remark.text.toStdString();
    }
    ASSERT_EQ(remarks.size(), expected.size()) << reason << all;
    for (std::size_t i = 0; i < remarks.size(); ++i) {
        EXPECT_EQ(remarks[i].text, QString::fromUtf8(expected[i].text)) << reason;
        EXPECT_STREQ(remarks[i].isError ? "error" : "warning", expected[i].severity) << reason;
        EXPECT_EQ(remarks[i].place.line, places[i].line) << reason << all;
        EXPECT_EQ(remarks[i].place.column, places[i].column) << reason << all;
    }
}

#include "JobPdfReader.h"

#include "Xlate.h"

#include <QRegularExpression>

namespace kareport
{

namespace
{

/// Whether a text has the form of a language tag: parts of letters and digits with hyphens between, the first of letters alone.
bool isLanguage(const QString &text)
{
    static const QRegularExpression tag(QStringLiteral("^[A-Za-z]{1,8}(-[A-Za-z0-9]{1,8})*\\z"));
    return tag.match(text).hasMatch();
}

} // namespace

std::shared_ptr<const Job::Pdf> readPdf(const JsonNode &node)
{
    if (!node.expectObject()) {
        return nullptr;
    }
    node.allowOnly({"title", "author", "creator", "language", "outline", "pageLabels"});
    auto pdf = std::make_shared<Job::Pdf>();
    if (const JsonNode title = node["title"]; title.exists()) {
        pdf->title = title.text();
    }
    pdf->author = node["author"].text();
    if (const JsonNode creator = node["creator"]; creator.exists()) {
        pdf->creator = creator.text();
    }
    if (const JsonNode language = node["language"]; language.exists()) {
        pdf->language = language.text();
        if (!isLanguage(pdf->language)) {
            language.fail(Xlate("a language such as de or en-GB was expected"));
        }
    }
    pdf->outline = node["outline"].boolean(true);
    pdf->pageLabels = node["pageLabels"].boolean(true);
    return pdf;
}

} // namespace kareport

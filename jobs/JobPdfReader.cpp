#include "JobPdfReader.h"

#include "LanguageTag.h"
#include "Xlate.h"

namespace kareport
{

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
        if (!isLanguageTag(pdf->language)) {
            language.fail(Xlate("a language such as de or en-GB was expected"));
        }
    }
    pdf->outline = node["outline"].boolean(true);
    pdf->pageLabels = node["pageLabels"].boolean(true);
    return pdf;
}

} // namespace kareport

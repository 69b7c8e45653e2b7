#include "UReportDoc.h"

#include "LeadingInteger.h"
#include "Profile.h"
#include "ReportExit.h"
#include "ReportParts.h"
#include "ReportWindow.h"
#include "Xlate.h"

#include <utility>

namespace
{

const QString printHashEntry = QStringLiteral("ReportPrintHash");

} // namespace

std::unordered_map<const UReportDoc *, bool> UReportDoc::UReportMgr;

UReportDoc::UReportDoc() : UReportDoc(QString(), false, false, nullptr) {}

UReportDoc::UReportDoc(const QString &name, bool externalEditor, bool closeDocument, UDocument *owner)
    : parts_(std::make_unique<kareport::ReportParts>(*this))
{
    parts_->owner = owner;
    parts_->externalEditor = externalEditor;
    parts_->closeDocument = closeDocument;
    if (!name.isNull()) {
        parts_->title = name;
        parts_->reportFileName = name;
    }
    SetHeader();
    LoadSettings();
    const QString printHash = GetProfileString(QString(), printHashEntry).trimmed();
    if (!printHash.isEmpty()) {
        kareport::ReportTemplate::printHash = kareport::leadingInteger(printHash) != 0;
    }
    enter();
}

UReportDoc::UReportDoc(const kareport::ReportSurroundings &surroundings)
    : parts_(std::make_unique<kareport::ReportParts>(*this))
{
    SetSurroundings(surroundings);
    SetHeader();
    enter();
}

void UReportDoc::enter()
{
    parts_->chainageLabel = Xlate("Station");
    UReportMgr.emplace(this, true); // nothing after it can fail: what is entered is alive
}

UReportDoc::~UReportDoc()
{
    UReportMgr.erase(this);
    kareport::forgetExit(*this);
    delete std::exchange(parts_->mirrors.window, nullptr);
}

bool UReportDoc::IsReportAvailable(const UReportDoc *report)
{
    return UReportMgr.contains(report);
}

QString UReportDoc::GetDocId() const
{
    return QString();
}

bool UReportDoc::IsThatDocId(const QString &) const
{
    return false;
}

void UReportDoc::SetSurroundings(const std::optional<kareport::ReportSurroundings> &surroundings)
{
    parts_->surroundings = surroundings;
    parts_->data.ownPrintHash = surroundings ? std::optional(surroundings->printHash) : std::nullopt;
    if (surroundings) {
        parts_->layout.margins = surroundings->margins;
        parts_->layout.fontSize = surroundings->fontSize;
    }
}

const std::optional<kareport::ReportSurroundings> &UReportDoc::GetSurroundings() const
{
    return parts_->surroundings;
}

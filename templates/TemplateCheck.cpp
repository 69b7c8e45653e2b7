#include "TemplateCheck.h"

#include "MemoryLasts.h"
#include "ScanNoteText.h"
#include "StandardText.h"
#include "TemplateChecker.h"

namespace kareport
{

namespace
{

std::optional<TemplateRemark> firstUnread(const TemplateFile &file)
{
    ScanNotes notes;
    readTemplateElements(scanTextOf(file), &notes);
    for (const ScanNote &note : notes) {
        if (note.tag == u"REPORTTEMPLATE" && isScanError(note)) {
            return TemplateRemark{TextPlaces(file.text()).of(note.source), true, scanNoteText(note)};
        }
    }
    return std::nullopt;
}

TemplateRemark noMemory()
{
    return {TextPlace(), true, noMemoryText()};
}

} // namespace

std::vector<TemplateRemark> checkTemplates(const TemplateFile &file, const TemplateCheckScope &scope)
{
    std::vector<TemplateRemark> remarks;
    if (!doneWhileMemoryLasts([&] { remarks = TemplateChecker(file, scope).check(); })) {
        remarks.push_back(noMemory());
    }
    return remarks;
}

std::optional<TemplateRemark> firstUnreadTemplate(const TemplateFile &file)
{
    std::optional<TemplateRemark> remark;
    if (!doneWhileMemoryLasts([&] { remark = firstUnread(file); })) {
        remark = noMemory();
    }
    return remark;
}

} // namespace kareport

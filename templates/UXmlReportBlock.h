#pragma once

#include "KaReportExport.h"
#include "UXmlReportTpl.h"

#include <QString>

/// A handle to a block of a template. It points into the template that loaded it, which must outlive it; copies point
/// to the same records.
class KAREPORT_EXPORT UXmlReportBlock
{
public:
    /// Points to the block of a name and its dictionary and options.
    /// @return false, and points to nothing, for a null template, an unknown block or one whose dictionary is missing
    bool LoadBlock(const QString &blockName, const UXmlReportTpl *reportTemplate);

    /// Whether the handle points to a block.
    bool IsLoaded() const { return block_ != nullptr; }

    /// A copy of the field at an index from 0; outside, a field with empty texts and zeros.
    sXmlReportField GetField(int index) const;
    /// 0 when no block is loaded.
    int GetFieldsCount() const;

private:
    const sXmlReportDictionary *dictionary_ = nullptr;
    const sXmlReportBlock *block_ = nullptr;
    const sXmlReportOption *option_ = nullptr;
};

#include "UXmlReportBlock.h"

bool UXmlReportBlock::LoadBlock(const QString &blockName, const UXmlReportTpl *reportTemplate)
{
    dictionary_ = nullptr;
    block_ = nullptr;
    if (reportTemplate == nullptr) {
        return false;
    }
    block_ = reportTemplate->GetBlock(blockName);
    if (block_ == nullptr) {
        return false;
    }
    dictionary_ = reportTemplate->GetDictionary(block_->Use);
    if (dictionary_ == nullptr) {
        block_ = nullptr;
        return false;
    }
    option_ = reportTemplate->GetOption();
    return true;
}

sXmlReportField UXmlReportBlock::GetField(int index) const
{
    return index >= 0 && index < GetFieldsCount() ? block_->Fields[static_cast<std::size_t>(index)] : sXmlReportField();
}

int UXmlReportBlock::GetFieldsCount() const
{
    return block_ != nullptr ? static_cast<int>(block_->Fields.size()) : 0;
}

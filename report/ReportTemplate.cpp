#include "ReportTemplate.h"

#include "Folders.h"

#include <QDir>

#include <algorithm>

namespace kareport
{

namespace
{

QString fileIn(QString folder, const QString &fileName)
{
    if (!folder.endsWith(u'/') && !folder.endsWith(QDir::separator())) {
        folder += QDir::separator();
    }
    return folder + fileName;
}

} // namespace

QStringList templatePaths(const QString &fileName)
{
    QStringList paths; // one after the other: a list of its members in braces does not survive when memory runs out
    paths.append(fileIn(GetLibraryDir(false), fileName));
    paths.append(fileIn(GetStartPathName(), fileName));
    return paths;
}

bool ReportTemplate::load(const QStringList &paths, const QString &templateName, const QString &tableName,
                          const QString &blockName)
{
    // The handles point into the template that is replaced: they are reset with it.
    table_.reset();
    block_.reset();
    template_ = std::make_unique<UXmlReportTpl>();
    template_->SetLabelText(labelText);
    const auto hasTemplate = [&](const QString &path) { return template_->LoadTemplate(path, templateName); };
    if (std::none_of(paths.begin(), paths.end(), hasTemplate)) {
        return false;
    }
    pageBreaks = template_->GetPageBreakXmlOption();
    // The option is a signed 8-bit character and is widened with its sign.
    separator =
        static_cast<char16_t>(static_cast<qint16>(static_cast<signed char>(template_->GetSeparatorXmlOption())));
    return (tableName.isEmpty() || loadTable(tableName)) && (blockName.isEmpty() || loadBlock(blockName));
}

bool ReportTemplate::loadTable(const QString &name)
{
    table_.reset();
    if (!template_) {
        return false;
    }
    auto table = std::make_unique<UXmlReportTable>();
    table->SetColumnSeparator(static_cast<char>(separator & 0xFF));
    if (!table->LoadTable(name, template_.get())) {
        return false;
    }
    if (template_->SetNorthEastTableFieldOrder(name, static_cast<ORIENTATION_ORDER>(settings.northEastOrder))) {
        table->ReorderingHeading();
    }
    if (!table->IsLoaded()) {
        return false;
    }
    table_ = std::move(table); // not before it is whole: what cannot be loaded is not written either
    return true;
}

bool ReportTemplate::loadBlock(const QString &name)
{
    block_.reset();
    if (!template_) {
        return false;
    }
    auto block = std::make_unique<UXmlReportBlock>();
    if (!block->LoadBlock(name, template_.get())) {
        return false;
    }
    blockName_ = name;
    block_ = std::move(block);
    return true;
}

} // namespace kareport

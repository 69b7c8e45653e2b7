#include "TagScanner.h"
#include "TemplateCheck.h"
#include "TemplateFile.h"
#include "TemplateNames.h"
#include "UXmlReportTable.h"
#include "UXmlReportTpl.h"

#include <QTemporaryFile>

#include <cstddef>
#include <cstdint>
#include <cstdlib>

namespace
{

void require(bool holds)
{
    if (!holds) {
        std::abort();
    }
}

/// The one pass over a list must find what cutting one element after the other finds.
void compareWithCutting(const kareport::ScanText &text, QStringView tag)
{
    kareport::ScanText rest = text;
    kareport::NodeSequence sequence(text, tag);
    for (;;) {
        const kareport::ScanElement cut = kareport::ExtractNode(rest, tag, true);
        const auto next = sequence.next();
        require(next.has_value() == !cut.value.isEmpty());
        if (!next) {
            return;
        }
        require(next->value.text() == cut.value.text());
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    const QByteArrayView bytes(data, static_cast<qsizetype>(size));
    const kareport::TemplateFile file(bytes);
    if (size < 4096) {
        for (const auto *tag : {u"FIELD", u"TABLE", u"NAME"}) {
            compareWithCutting(scanTextOf(file), tag);
        }
    }
    kareport::checkTemplates(file);

    static QTemporaryFile onDisk;
    require(onDisk.isOpen() || onDisk.open());
    onDisk.resize(0);
    onDisk.seek(0);
    onDisk.write(bytes.data(), bytes.size());
    onDisk.flush();
    UXmlReportTpl reportTemplate;
    for (const QString &name : kareport::templateNames(file)) {
        if (!reportTemplate.LoadTemplate(onDisk.fileName(), name)) {
            require(name.isEmpty());
            continue;
        }
        QStringList tables;
        reportTemplate.GetAllTables(tables);
        for (const QString &table : tables) {
            UXmlReportTable handle;
            handle.LoadTable(table, &reportTemplate);
            if (reportTemplate.SetNorthEastTableFieldOrder(table, ORDER_EASTING_NORTHING)) {
                handle.ReorderingHeading();
            }
        }
    }
    return 0;
}

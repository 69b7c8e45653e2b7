#include "ReportEditorFixture.h"

void ShownPane::ShowPane(bool show)
{
    (show ? shows : hides)++;
    CViewPane::ShowPane(show);
}

ReportEditor::ReportEditor()
{
    reports_ = application_.AddDocTemplate(std::make_unique<UDocTemplate>(
        1, [this] { return std::make_unique<UReportDoc>(QString(), false, closesConverted, nullptr); },
        [] { return new ShownPane; }, [] { return std::make_unique<TestReportView>(); },
        QStringLiteral("REPORTDOCTEMPLATE"), 1, 1));
}

UReportDoc *ReportEditor::create(const QString &name, bool externalEditor)
{
    return CreateReport(name, false, externalEditor, nullptr, 0, nullptr);
}

UReportDoc *ReportEditor::createWritten(const QString &name)
{
    UReportDoc *report = create(name);
    report->WriteLine(QStringLiteral("text"), 0, 1, 0);
    return report;
}

TestReportView *ReportEditor::viewOf(const UReportDoc *report)
{
    return static_cast<TestReportView *>(report->GetViews().at(0));
}

std::string richTextOf(const std::vector<std::string> &lines)
{
    std::string text =
        "{\\rtf1\\ansi\\ansicpg1252\\deff0\\deflang1033{\\fonttbl{\\f8\\fnil\\fcharset0 Lucida Console;}}";
    for (const std::string &line : lines) {
        text += "\\viewkind4\\uc1\\pard\\f1\\fs18 " + line + " \\par";
    }
    return text + "}";
}

#include "DeskFixture.h"

#include "DeskCommandIds.h"
#include "ReportSaveName.h"
#include "SaveDialog.h"

#include <QAction>

#include <gtest/gtest.h>

Desk::Desk()
{
    QStandardPaths::setTestModeEnabled(true);
    kareport::setProfileStore(kareport::makeMemoryProfile());
    kareport::setMessageBox([this](const kareport::Message &message) {
        messages.append(message.text);
        return answer;
    });
    kareport::setSaveFailure(kareport::sayNotSaved);
    application.emplace();
    frame.emplace();
    frame->show();
}

Desk::~Desk()
{
    frame.reset();
    application.reset();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    kareport::setMessageBox({});
    kareport::setSaveFailure({});
    kareport::setProfileStore(kareport::makeMemoryProfile());
}

std::vector<UReportDoc *> Desk::reports()
{
    std::vector<UReportDoc *> found;
    for (UDocument *document : GetReportTemplate()->GetDocuments()) {
        found.push_back(dynamic_cast<UReportDoc *>(document));
    }
    return found;
}

void Desk::keepReportWindows()
{
    frame->UpdateCommands();
    if (!frame->CommandAction(kareport::keepReportWindowCommand)->isChecked()) {
        ASSERT_TRUE(frame->OnCommand(kareport::keepReportWindowCommand));
    }
}

QString Desk::textOf(const UReportDoc &report)
{
    return report.CopyText().replace(QStringLiteral("\r\n"), QStringLiteral("\n"));
}

QByteArray lineJob(const char *line)
{
    return R"({"title": "Lines", "header": false, "page": {"linesPerPage": 60, "charsPerRow": 80},
               "report": [{"line": ")" +
           QByteArray(line) + R"("}]})";
}

#pragma once

#include "AppMessageBox.h"
#include "DeskApplication.h"
#include "DeskFrame.h"
#include "Folders.h"
#include "JobFolder.h"
#include "Profile.h"
#include "ReportEntry.h"
#include "TemplateJob.h"
#include "UReportDoc.h"

#include <QCoreApplication>
#include <QDockWidget>
#include <QEvent>
#include <QStandardPaths>
#include <QTest>

#include <vector>

/// The desktop program with preferences of its own, and somebody who answers its questions.
class Desk
{
public:
    Desk()
    {
        QStandardPaths::setTestModeEnabled(true);
        kareport::setProfileStore(kareport::makeMemoryProfile());
        kareport::setMessageBox([this](const kareport::Message &message) {
            messages.append(message.text);
            return answer;
        });
        application.emplace();
        frame.emplace();
        frame->show();
    }
    ~Desk()
    {
        frame.reset();
        application.reset();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        kareport::setMessageBox({});
        kareport::setProfileStore(kareport::makeMemoryProfile());
    }
    Desk(const Desk &) = delete;
    Desk &operator=(const Desk &) = delete;

    static std::vector<UReportDoc *> reports()
    {
        std::vector<UReportDoc *> found;
        for (UDocument *document : GetReportTemplate()->GetDocuments()) {
            found.push_back(dynamic_cast<UReportDoc *>(document));
        }
        return found;
    }
    static QString textOf(const UReportDoc &report)
    {
        return report.CopyText().replace(QStringLiteral("\r\n"), QStringLiteral("\n"));
    }

    MessageAnswer answer = MessageAnswer::Ok;
    QStringList messages;
    std::optional<DeskApplication> application;
    std::optional<DeskFrame> frame;
};

/// A job of one line, with another text where it is given.
inline QByteArray lineJob(const char *line = "First line")
{
    return R"({"title": "Lines", "header": false, "page": {"linesPerPage": 60, "charsPerRow": 80},
               "report": [{"line": ")" +
           QByteArray(line) + R"("}]})";
}

#pragma once

#include "AppMessageBox.h"
#include "DeskApplication.h"
#include "DeskFrame.h"
#include "Folders.h"
#include "Job.h"
#include "JobFolder.h"
#include "Profile.h"
#include "ReportEntry.h"
#include "UReportDoc.h"

#include <QCoreApplication>
#include <QDockWidget>
#include <QEvent>
#include <QStandardPaths>
#include <QTest>

#include <vector>

/// The desktop program with preferences of its own, and something that answers its questions.
class Desk
{
public:
    Desk();
    ~Desk();
    Desk(const Desk &) = delete;
    Desk &operator=(const Desk &) = delete;

    static std::vector<UReportDoc *> reports();
    static QString textOf(const UReportDoc &report);
    /// Has reports of jobs stay in their report windows, as the user's pin does.
    void keepReportWindows();

    MessageAnswer answer = MessageAnswer::Ok;
    QStringList messages;
    std::optional<DeskApplication> application;
    std::optional<DeskFrame> frame;
};

/// The bytes of a report file of one line.
inline QByteArray savedText(const char *line)
{
    return "\xEF\xBB\xBF" + QByteArray(line) + "\r\r\n";
}

/// A job of one line, with another text where it is given.
QByteArray lineJob(const char *line = "First line");

#pragma once

#include "AppMessageBox.h"
#include "ApplicationTitle.h"
#include "CViewPane.h"
#include "Clock.h"
#include "DefaultPrinter.h"
#include "Folders.h"
#include "PrintQt.h"
#include "Profile.h"
#include "ReportEntry.h"
#include "ReportViewPort.h"
#include "ReportWindow.h"
#include "UApplication.h"
#include "UPreviewDlg.h"
#include "UReportDoc.h"
#include "UView.h"

#include <QDateTime>
#include <QIODevice>
#include <QString>

#include <memory>

/// Fixes what reports depend on (preferences, clock, printer) for one test and puts it back afterwards: when the last of
/// several has gone.
class FixedSurroundings
{
public:
    FixedSurroundings();
    ~FixedSurroundings();
    FixedSurroundings(const FixedSurroundings &) = delete;
    FixedSurroundings &operator=(const FixedSurroundings &) = delete;

private:
    static void fix();

    static inline int count_ = 0;
};

/// A text whose lines end with LF, as a report ends them.
QString reportLines(QString text);

QString textOf(const UReportDoc &report);

/// The page header that a report of the fixed surroundings begins a page with, without line ends. For 80 characters a
/// row and titles of up to 30.
QString headerOf(const QString &title, int page);

/// A pane that counts how often it is asked to show its title again.
class CountingPane : public CViewPane
{
public:
    void UpdateTitle() override { ++titleUpdates; }
    int titleUpdates = 0;
};

/// A view that shows a report.
class TestReportView : public UView, public kareport::ReportViewPort
{
public:
    void OnUpdate(UView *, long, void *) override { ++updates; }
    bool streamRichText(QIODevice &device) const override { return device.write(richText) == richText.size(); }
    bool streamPlainText(QIODevice &device) const override { return device.write(plainText) == plainText.size(); }

    int updates = 0;
    QByteArray richText = "{\\rtf1 of the view}"; ///< what the view streams out
    QByteArray plainText;
};

/// An application with the document template for reports. Reports that are still open are closed with it.
class ReportApplication : public UApplication
{
public:
    ReportApplication();
    ~ReportApplication() override;

    UDocTemplate *reportTemplate() const { return reportTemplate_; }
    /// A report with a pane of its own.
    UReportDoc *create(const QString &name) { return CreateReport(name, false, false, nullptr, 0, nullptr); }

private:
    UDocTemplate *reportTemplate_;
};

/// A report window that keeps what it is given.
class TestReportWindow : public kareport::ReportWindow
{
public:
    explicit TestReportWindow(CViewPane *pane = nullptr, bool *destroyed = nullptr);
    ~TestReportWindow() override;
    void WriteLine(const QString &piece) override { pieces += piece; }
    CViewPane *GetOwningPane() override { return pane_; }
    bool isCreated() const override { return created; }
    bool createDocked(const QString &caption, UView *previousView) override;
    void showBar(bool show) override { calls += show ? QStringLiteral("show") : QStringLiteral("hide"); }
    void setActive(bool active) override { calls += active ? QStringLiteral("active") : QStringLiteral("not active"); }
    void takeFocus() override { calls += QStringLiteral("focus"); }

    QStringList pieces;
    QStringList calls;
    UView *previous = nullptr;
    bool created = true;
    bool canBeCreated = true;

private:
    CViewPane *pane_;
    bool *destroyed_;
};

/// Puts a new view of a document into a pane.
template <typename View>
View *showIn(CViewPane &pane, UDocument &document)
{
    auto view = std::make_unique<View>();
    View *shown = view.get();
    pane.AddView(std::move(view));
    document.AddView(shown);
    return shown;
}

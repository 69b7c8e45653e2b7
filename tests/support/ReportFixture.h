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
    FixedSurroundings()
    {
        if (++count_ == 1) {
            fix();
        }
    }
    ~FixedSurroundings()
    {
        if (--count_ > 0) {
            return;
        }
        // The flag is one for all reports and outlives the preferences that it was read from.
        WriteProfileString(QString(), QStringLiteral("ReportPrintHash"), QStringLiteral("0"));
        {
            const UReportDoc resetsPrintHash;
        }
        kareport::setProfileStore(kareport::makeMemoryProfile());
        kareport::fixTime(std::nullopt);
        kareport::setDefaultPrinter({});
        kareport::setLibraryDir(QString());
        kareport::setStartPathName(QString());
        kareport::setMessageHandler({});
        SetApplicationTitle(QStringLiteral("TALVEN"));
        UPreviewDlg::SetModulePrinterOrientationPortrait(true);
    }
    FixedSurroundings(const FixedSurroundings &) = delete;
    FixedSurroundings &operator=(const FixedSurroundings &) = delete;

private:
    static void fix()
    {
        kareport::setProfileStore(kareport::makeMemoryProfile());
        kareport::fixTime(QDateTime(QDate(2024, 3, 5), QTime(14, 7)));
        kareport::setDefaultPrinter({kareport::PrinterSource::BuiltIn, kareport::PaperSize::A4, 600});
    }

    static inline int count_ = 0;
};

/// A text whose lines end with LF, as a report ends them.
inline QString reportLines(QString text)
{
    return text.replace(u'\n', QStringLiteral("\r\n"));
}

inline QString textOf(const UReportDoc &report)
{
    return report.GetText().toString();
}

/// The page header that a report of the fixed surroundings begins a page with, without line ends. For 80 characters a
/// row and titles of up to 30.
inline QString headerOf(const QString &title, int page)
{
    const QString front = QStringLiteral("TALVEN - ") + title;
    return front + u' ' + QStringLiteral("Mar 05, 2024  02:07PM").rightJustified(80 - front.size() - 20) +
           QStringLiteral("    Page:") + QString::number(page).rightJustified(3);
}

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
    ReportApplication()
        : reportTemplate_(AddDocTemplate(kareport::makeReportTemplate(
              [] { return new CountingPane; }, [] { return std::make_unique<TestReportView>(); })))
    {}
    ~ReportApplication() override
    {
        while (!reportTemplate_->GetDocuments().empty()) {
            auto *report = static_cast<UReportDoc *>(reportTemplate_->GetDocuments().back());
            report->SetAutoDelete(true);
            report->SetCloseDocument(2);
            report->OnCloseDocument();
        }
    }

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
    explicit TestReportWindow(CViewPane *pane = nullptr, bool *destroyed = nullptr) : pane_(pane), destroyed_(destroyed)
    {}
    ~TestReportWindow() override
    {
        if (destroyed_ != nullptr) {
            *destroyed_ = true;
        }
    }
    void WriteLine(const QString &piece) override { pieces += piece; }
    CViewPane *GetOwningPane() override { return pane_; }
    bool isCreated() const override { return created; }
    bool createDocked(const QString &caption, UView *previousView) override
    {
        calls += QStringLiteral("create ") + caption;
        previous = previousView;
        created = canBeCreated;
        return created;
    }
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

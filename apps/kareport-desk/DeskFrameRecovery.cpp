#include "DeskFrame.h"

#include "AppMessageBox.h"
#include "SavedReports.h"
#include "UReportDoc.h"
#include "Xlate.h"

#include <utility>

namespace
{

/// The line of a message about a report that could not be opened again.
QString lineOf(const kareport::KeptReport &kept, const kareport::ReadNotes &notes)
{
    const QString missing = kept.textFile.isEmpty() ? kareport::whyNotOpened(kept.path) : QString();
    const QString reason = missing.isEmpty() ? notes.problem : missing;
    return reason.isEmpty() ? kept.name() : kept.name() + QStringLiteral(": ") + reason;
}

} // namespace

std::vector<kareport::KeptReport> DeskFrame::reopen(const std::vector<kareport::KeptReport> &left)
{
    std::vector<kareport::KeptReport> notReopened;
    QStringList lost;
    bool isTextKept = false;
    kareport::ReadNotes notes;
    for (const kareport::KeptReport &kept : left) {
        const auto open = [&] { return kareport::reopenReport(kept, &notes); };
        notes.problem.clear();
        UReportDoc *report = notes.isStopped ? nullptr : read(kept.path, open);
        if (report != nullptr) {
            activate(report);
            sayWhatIsNotShown(kept.path, std::exchange(notes, {}));
            continue;
        }
        notReopened.push_back(kept);
        if (!notes.isStopped) {
            lost.append(lineOf(kept, notes));
            isTextKept = isTextKept || kept.holdsText();
        }
    }
    if (!lost.isEmpty()) {
        QString text = Xlate("These reports could not be opened again:\n\n%1").arg(lost.join(u'\n'));
        if (isTextKept) {
            text += QStringLiteral("\n\n") +
                    Xlate("Their unsaved changes are kept and will be offered again at the next start.");
        }
        kareport::showMessage({text, QString(), MessageButtons::Ok, kareport::MessageIcon::Information});
    }
    return notReopened;
}

void DeskFrame::OfferLeftReports()
{
    const std::vector<kareport::KeptReport> left = recovery_.leftReports();
    if (!recovery_.unreadableFolders().isEmpty()) {
        kareport::showMessage(
            {Xlate("KaReport did not end properly, and what it had open cannot be read. These folders "
                   "were not changed:\n\n%1")
                 .arg(recovery_.unreadableFolders().join(u'\n')),
             QString(), MessageButtons::Ok, kareport::MessageIcon::Information});
    }
    QStringList names;
    for (const kareport::KeptReport &kept : left) {
        names.append(kept.name() + (kept.textFile.isEmpty() ? QString() : Xlate(" (with unsaved changes)")));
    }
    std::vector<kareport::KeptReport> notReopened;
    if (!left.empty()) {
        const MessageAnswer answer = kareport::showMessage(
            {Xlate("KaReport did not end properly the last time. These reports were open:\n\n%1\n\nOpen them again?")
                 .arg(names.join(u'\n')),
             QString(), MessageButtons::YesNoCancel, kareport::MessageIcon::Question});
        if (answer == MessageAnswer::Cancel) {
            return; // they are offered again at the next start
        }
        if (answer == MessageAnswer::Yes) {
            notReopened = reopen(left);
        }
        if (!recovery_.keep()) {
            return; // a full disk: the copies stay where they are
        }
    }
    recovery_.discardLeft(notReopened);
}

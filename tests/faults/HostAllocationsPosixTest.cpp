#include "FailingAllocation.h"
#include "FrameFixture.h"
#include "Profile.h"
#include "ReportFixture.h"
#include "ReportSubject.h"
#include "TemporaryFolder.h"
#include "UDataObjectList.h"
#include "UPointNumber.h"

#include <gtest/gtest.h>

#include <cctype>
#include <memory>
#include <new>
#include <ostream>

// The host's own classes without memory. They say so by std::bad_alloc, as Qt and the standard library do, and what an
// operation has begun is then done or not.

namespace
{

const QString longName = QStringLiteral("a name that is long enough to need memory of its own");

/// Documents with panes, and data.
class HostSubject
{
public:
    HostSubject()
    {
        putFile(path, "of a file");
        putFile(savedPath, "earlier");
        document = application.open();
        document->content = "content";
        other = application.open();
        document->SetTitle(QStringLiteral("Title"));
        application.AddToRecentFileList(QStringLiteral("/recent/a"));
        spare = new RecordingPane(log);
        spareView = new RecordingView;
        spare->AddView(std::unique_ptr<UView>(spareView));
        for (const char *name : {"b", "c", "a"}) {
            UDataObject &object = list.Add();
            object.Set(1, UPointNumber(QString::fromUtf8(name)));
        }
        dictionary.Set(7, QStringLiteral("seven"));
    }
    HostSubject(const HostSubject &) = delete;
    HostSubject &operator=(const HostSubject &) = delete;

    /// All that operations may change.
    QString state()
    {
        QStringList all;
        for (const UDocument *open : application.texts().GetDocuments()) {
            all.append(QStringLiteral("document %1, %2, %3, %4 views")
                           .arg(open->GetTitle(), open->GetPathName(),
                                QString::fromLatin1(static_cast<const TextDocument *>(open)->content))
                           .arg(open->GetViews().size()));
        }
        for (const CViewPane *pane : log.panes) {
            all.append(QStringLiteral("pane %1, %2 views, visible: %3")
                           .arg(pane->GetCaption())
                           .arg(pane->GetViews().size())
                           .arg(pane->IsVisible()));
        }
        all.append(application.GetRecentFileList().join(u' '));
        for (std::size_t i = 0; UDataObject *object = list.GetAt(i); ++i) {
            const UDictEntry *entry = object->Find(1);
            all.append(entry != nullptr ? static_cast<const UPointNumber *>(entry->GetData())->Convert()
                                        : QStringLiteral("empty"));
        }
        for (const unsigned id : {7U, 8U}) {
            const UDictEntry *entry = dictionary.Find(id);
            all.append(entry != nullptr ? *static_cast<const QString *>(entry->GetData()) : QStringLiteral("none"));
        }
        all.append(QString::fromStdString(contentOf(savedPath)));
        all.append(GetProfileString(QStringLiteral("Section"), QStringLiteral("Entry"), QStringLiteral("none")));
        // The folder is another one each time, and a file that could not be opened may be a recent one all the same.
        return QString(all.join(u'\n') + u'\n' + answer)
            .replace(folder_.at(QString()), QStringLiteral("~"))
            .replace(QStringLiteral("~a.txt /recent/a"), QStringLiteral("/recent/a"));
    }

private:
    const FixedSurroundings surroundings_;
    const TemporaryFolder folder_;

public:
    const QString path = folder_.at(QStringLiteral("a.txt"));
    const QString savedPath = folder_.at(QStringLiteral("s.txt"));
    FrameLog log;
    TextApplication application{log};
    AnsweredMessages messages{MessageAnswer::No};
    TextDocument *document = nullptr;
    TextDocument *other = nullptr;
    RecordingPane *spare = nullptr;
    RecordingView *spareView = nullptr;
    UDataObjectList list;
    UDictionary dictionary;
    QString answer;
};

struct HostOperation
{
    const char *name;
    void (*act)(HostSubject &subject);
    bool mayEmpty = false; ///< a document that is read may be empty when that fails
};

void PrintTo(const HostOperation &operation, std::ostream *out)
{
    *out << operation.name;
}

constexpr HostOperation operations[] = {
    {"SetTitle", [](HostSubject &s) { s.document->SetTitle(longName); }},
    {"SetPathName", [](HostSubject &s) { s.document->SetPathName(s.path, true); }},
    {"AddView", [](HostSubject &s) { s.document->AddView(s.spareView); }},
    {"UpdateAllViews", [](HostSubject &s) { s.document->UpdateAllViews(nullptr, 1, nullptr); }},
    {"UpdateFrameCounts", [](HostSubject &s) { s.document->UpdateFrameCounts(); }},
    {"ShowPane", [](HostSubject &s) { s.document->GetViews().front()->GetParentPane()->ShowPane(false); }},
    {"SetWindowTextW", [](HostSubject &s) { s.spare->SetWindowTextW(longName); }},
    {"IsShown",
     [](HostSubject &s) { s.answer = s.document->IsShown() ? QStringLiteral("yes") : QStringLiteral("no"); }},
    {"OnNewDocument", [](HostSubject &s) { s.document->OnNewDocument(); }, true},
    {"OnOpenDocument", [](HostSubject &s) { s.document->OnOpenDocument(s.path); }, true},
    {"OnSaveDocument", [](HostSubject &s) { s.document->OnSaveDocument(s.savedPath); }},
    {"DoSave", [](HostSubject &s) { s.document->DoSave(s.savedPath, false); }},
    {"SaveModified",
     [](HostSubject &s) {
         s.document->SetModifiedFlag(true);
         s.answer = s.document->SaveModified() ? QStringLiteral("yes") : QStringLiteral("no");
     }},
    {"OpenReportDocumentFile, a new one",
     [](HostSubject &s) { s.application.texts().OpenReportDocumentFile(QString(), 1, 1, nullptr, 0, nullptr); }},
    {"OpenReportDocumentFile, of a file",
     [](HostSubject &s) { s.application.texts().OpenReportDocumentFile(s.path, 1, 1, nullptr, 0, nullptr); }},
    {"OpenReportDocumentFile, into a pane",
     [](HostSubject &s) { s.application.texts().OpenReportDocumentFile(QString(), 1, 1, s.spare, 0, nullptr); }},
    {"CreateNewPane", [](HostSubject &s) { s.application.texts().CreateNewPane(s.document, nullptr, 0, nullptr); }},
    {"InitialUpdatePane",
     [](HostSubject &s) {
         s.application.texts().InitialUpdatePane(s.document->GetViews().front()->GetParentPane(), s.document, 1);
     }},
    {"AddToRecentFileList", [](HostSubject &s) { s.application.AddToRecentFileList(longName); }},
    {"GetDocuments", [](HostSubject &s) { s.answer = QString::number(s.application.GetDocuments().size()); }},
    {"IsOpen",
     [](HostSubject &s) { s.answer = s.application.IsOpen(s.other) ? QStringLiteral("yes") : QStringLiteral("no"); }},
    {"GetPaneCaptions",
     [](HostSubject &s) {
         QStringList captions;
         CViewPane::GetPaneCaptions(captions);
         s.answer = captions.join(u',');
     }},
    {"Add, an object", [](HostSubject &s) { s.list.Add(); }},
    {"Sort", [](HostSubject &s) { s.list.Sort({1}); }},
    {"Set, another value", [](HostSubject &s) { s.dictionary.Set(8, QString(longName)); }},
    {"Set, in the place of a value", [](HostSubject &s) { s.dictionary.Set(7, QString(longName)); }},
    {"Refill", [](HostSubject &s) { s.dictionary.Refill<QString>(7) = longName; }},
    {"Remove", [](HostSubject &s) { s.dictionary.Remove(7); }},
    {"WriteProfileString",
     [](HostSubject &) { WriteProfileString(QStringLiteral("Section"), QStringLiteral("Entry"), longName); }},
    {"GetProfileString",
     [](HostSubject &s) { s.answer = GetProfileString(QString(), QStringLiteral("No entry"), longName); }},
};

class HostAllocations : public testing::TestWithParam<HostOperation>
{};

TEST_P(HostAllocations, AnyOfThemMayFail)
{
    QString before;
    QString after;
    {
        HostSubject subject;
        before = subject.state();
        GetParam().act(subject);
        after = subject.state();
    }
    failingEachAllocation([&](qint64 number) {
        HostSubject subject;
        bool hasFailed = false;
        bool isDone = true;
        try {
            const FailingAllocation failing(number);
            try {
                GetParam().act(subject);
            } catch (const std::bad_alloc &) {
                isDone = false;
            }
            hasFailed = failing.hasFailed();
        } catch (...) {
            ADD_FAILURE() << number << ": another exception";
        }
        const QString state = subject.state();
        EXPECT_TRUE(state == before || state == after || (GetParam().mayEmpty && subject.document->content.isEmpty()))
            << number << (isDone ? ", done: " : ": ") << state.toStdString();
        EXPECT_TRUE(hasFailed || state == after) << number;
        EXPECT_TRUE(!isDone || !hasFailed || !GetParam().mayEmpty || state == before || state == after);
        // What is there can be used.
        subject.document->SetTitle(QStringLiteral("Title again"));
        EXPECT_EQ(subject.document->GetTitle(), QStringLiteral("Title again"));
        return hasFailed && !testing::Test::HasFailure();
    });
}

INSTANTIATE_TEST_SUITE_P(Operations, HostAllocations, testing::ValuesIn(operations), [](const auto &operation) {
    std::string name;
    for (const char letter : std::string(operation.param.name)) {
        name += std::isalnum(static_cast<unsigned char>(letter)) != 0 ? std::string(1, letter) : std::string();
    }
    return name;
});

} // namespace

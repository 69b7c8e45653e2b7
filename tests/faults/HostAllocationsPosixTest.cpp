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

// The host's own classes without memory: what an operation has begun is then done or not, and its answer says which. A few
// hand a value out, or take one, and have no answer for that: they throw std::bad_alloc, and change nothing.

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
        other->content = "other content";
        other->SetPathName(savedPath, false);
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

    UDocTemplate &texts() const { return application.texts(); }

    /// All that operations may change.
    QString state()
    {
        QStringList all;
        for (const UDocument *open : application.texts().GetDocuments()) {
            all.append(QStringLiteral("document %1, %2, %3, %4 views")
                           .arg(open->GetTitle(), open->GetPathName(),
                                QString::fromLatin1(static_cast<const TextDocument *>(open)->content))
                           .arg(open->GetViews().size()) +
                       (open->IsModified() ? QStringLiteral(", modified") : QString()));
        }
        for (const CViewPane *pane : log.panes) {
            all.append(QStringLiteral("pane %1, %2 views, visible: %3, style %4%5")
                           .arg(pane->GetCaption())
                           .arg(pane->GetViews().size())
                           .arg(pane->IsVisible())
                           .arg(pane->GetStyle())
                           .arg(pane->GetRect() ? QStringLiteral(", placed") : QString()));
        }
        all.append(QStringLiteral("%1 templates").arg(application.GetDocTemplates().size()));
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
        // The folder is another one each time. A file may be a recent one, also where it could not be opened, or not.
        return QString(all.join(u'\n'))
            .replace(folder_.at(QString()), QStringLiteral("~"))
            .replace(QStringLiteral("~a.txt /recent/a"), QStringLiteral("/recent/a"))
            .replace(QStringLiteral("~s.txt /recent/a"), QStringLiteral("/recent/a"));
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
    std::unique_ptr<RecordingView> newView = std::make_unique<RecordingView>();
    const QRect place{1, 2, 300, 200};
    std::unique_ptr<UDocTemplate> newTemplate = std::make_unique<UDocTemplate>(
        2, UDocTemplate::DocumentFactory(), UDocTemplate::PaneFactory(), UDocTemplate::ViewFactory(), longName, 1, 1);
    QStringList captions;
    const std::vector<unsigned> ids{1};
};

struct HostOperation
{
    const char *name;
    bool (*act)(HostSubject &subject);                 ///< whether it says that all was done
    void (*otherwise)(HostSubject &subject) = nullptr; ///< what it may leave where it fails, beside what was there
    void (*atWorst)(HostSubject &subject) = nullptr;   ///< the same
    bool throws = false;                               ///< there is no answer for it
    bool isSilent = false;                             ///< nothing is lost where it is not done
};

void PrintTo(const HostOperation &operation, std::ostream *out)
{
    *out << operation.name;
}

void emptyUnread(HostSubject &s)
{
    s.document->content.clear();
    s.document->SetModifiedFlag(true);
}

void modify(HostSubject &s)
{
    s.document->SetModifiedFlag(true);
}

CViewPane *paneOf(const HostSubject &s)
{
    return s.document->GetViews().front()->GetParentPane();
}

constexpr HostOperation operations[] = {
    {"SetTitle",
     [](HostSubject &s) {
         s.document->SetTitle(longName);
         return static_cast<const UDocument *>(s.document)->GetTitle() == longName;
     }},
    {"SetPathName",
     [](HostSubject &s) {
         s.document->SetPathName(s.path, true);
         return s.document->GetPathName() == s.path;
     }},
    {"AddView",
     [](HostSubject &s) {
         s.document->AddView(s.spareView);
         return s.spareView->GetDocument() == s.document;
     }},
    {"AddView, to a pane",
     [](HostSubject &s) {
         s.spare->AddView(std::move(s.newView));
         return s.spare->GetViews().size() == 2;
     }},
    {"UpdateAllViews",
     [](HostSubject &s) {
         s.document->UpdateAllViews(nullptr, 1, nullptr);
         return true;
     }},
    {"UpdateFrameCounts",
     [](HostSubject &s) {
         s.document->UpdateFrameCounts();
         return true;
     }},
    {"ShowPane",
     [](HostSubject &s) {
         paneOf(s)->ShowPane(false);
         return true;
     }},
    {"SetPlace",
     [](HostSubject &s) {
         s.spare->SetPlace(nullptr, 7, &s.place);
         return s.spare->GetRect() == s.place;
     }},
    {"SetWindowTextW",
     [](HostSubject &s) {
         s.spare->SetWindowTextW(longName);
         return s.spare->GetWindowTextW() == longName;
     }},
    {"IsShown", [](HostSubject &s) { return s.document->IsShown(); }},
    {"OnNewDocument", [](HostSubject &s) { return s.document->OnNewDocument(); }},
    {"OnOpenDocument", [](HostSubject &s) { return s.document->OnOpenDocument(s.path); }, emptyUnread},
    {"OnSaveDocument", [](HostSubject &s) { return s.document->OnSaveDocument(s.savedPath); }},
    {"DoSave", [](HostSubject &s) { return s.document->DoSave(s.savedPath, false); }},
    {"DoSave, under a new path",
     [](HostSubject &s) {
         s.document->SetModifiedFlag(true);
         return s.document->DoSave(s.savedPath, true);
     },
     modify,
     [](HostSubject &s) { // there was no memory for the path
         s.document->OnSaveDocument(s.savedPath);
         s.document->SetModifiedFlag(true);
     }},
    {"DoFileSave",
     [](HostSubject &s) {
         s.other->SetModifiedFlag(true);
         return s.other->DoFileSave();
     },
     [](HostSubject &s) { s.other->SetModifiedFlag(true); }},
    {"SaveModified",
     [](HostSubject &s) {
         s.document->SetModifiedFlag(true);
         return s.document->SaveModified();
     },
     modify},
    {"CanCloseFrame",
     [](HostSubject &s) {
         s.document->SetModifiedFlag(true);
         return s.document->CanCloseFrame(paneOf(s));
     },
     modify},
    {"OpenReportDocumentFile, a new one",
     [](HostSubject &s) { return s.texts().OpenReportDocumentFile(QString(), 1, 1, nullptr, 0, nullptr) != nullptr; }},
    {"OpenReportDocumentFile, of a file",
     [](HostSubject &s) { return s.texts().OpenReportDocumentFile(s.path, 1, 1, nullptr, 0, nullptr) != nullptr; }},
    {"OpenReportDocumentFile, into a pane",
     [](HostSubject &s) { return s.texts().OpenReportDocumentFile(QString(), 1, 1, s.spare, 0, nullptr) != nullptr; }},
    {"CreateNewPane",
     [](HostSubject &s) { return s.texts().CreateNewPane(s.document, nullptr, 0, nullptr) != nullptr; }},
    {"InitialUpdatePane",
     [](HostSubject &s) {
         paneOf(s)->ShowPane(false);
         s.texts().InitialUpdatePane(paneOf(s), s.document, 1);
         return paneOf(s)->IsVisible();
     },
     [](HostSubject &s) { paneOf(s)->ShowPane(false); }},
    {"CloseAllDocuments",
     [](HostSubject &s) {
         s.application.CloseAllDocuments();
         return s.texts().GetDocuments().empty();
     }},
    {"AddDocTemplate",
     [](HostSubject &s) { return s.application.AddDocTemplate(std::move(s.newTemplate)) != nullptr; }},
    {"AddToRecentFileList",
     [](HostSubject &s) {
         s.application.AddToRecentFileList(longName);
         return s.application.GetRecentFileList().front() == longName;
     }},
    {"IsOpen", [](HostSubject &s) { return s.application.IsOpen(s.other); }},
    {"Sort",
     [](HostSubject &s) {
         s.list.Sort(s.ids);
         return true;
     }},
    {"Remove",
     [](HostSubject &s) {
         s.dictionary.Remove(7);
         return s.dictionary.Find(7) == nullptr;
     }},
    {"WriteProfileString",
     [](HostSubject &) {
         WriteProfileString(QStringLiteral("Section"), QStringLiteral("Entry"), longName);
         return true;
     },
     nullptr, nullptr, false, true},
    {"GetDocuments", [](HostSubject &s) { return s.application.GetDocuments().size() == 2; }, nullptr, nullptr, true},
    {"GetPaneCaptions",
     [](HostSubject &s) {
         CViewPane::GetPaneCaptions(s.captions);
         return s.captions.size() == std::ssize(s.log.panes);
     },
     nullptr, nullptr, true},
    {"Add, an object", [](HostSubject &s) { return &s.list.Add() == s.list.GetAt(3); }, nullptr, nullptr, true},
    {"Set, another value",
     [](HostSubject &s) {
         s.dictionary.Set(8, QString(longName));
         return true;
     },
     nullptr, nullptr, true},
    {"Set, in place of a value",
     [](HostSubject &s) {
         s.dictionary.Set(7, QString(longName));
         return true;
     }},
    {"Refill",
     [](HostSubject &s) {
         s.dictionary.Refill<QString>(8) = longName;
         return true;
     },
     nullptr, nullptr, true},
    {"GetProfileString",
     [](HostSubject &) { return GetProfileString(QStringLiteral("Section"), QStringLiteral("No entry")).isEmpty(); },
     nullptr, nullptr, true},
};

class HostAllocations : public testing::TestWithParam<HostOperation>
{
protected:
    /// Does the operation with a request for memory failing. @return whether it failed
    bool attempt(qint64 number)
    {
        HostSubject subject;
        bool hasFailed = false;
        bool isDone = false;
        bool isThrown = false;
        {
            const FailingAllocation failing(number);
            try {
                isDone = GetParam().act(subject);
            } catch (const std::bad_alloc &) {
                isThrown = true;
            }
            hasFailed = failing.hasFailed();
        }
        EXPECT_TRUE(!isThrown || GetParam().throws) << number << ": an exception comes out";
        const QString state = subject.state();
        if (isDone) {
            EXPECT_TRUE(state == after || (GetParam().isSilent && state == before))
                << number << ", done: " << state.toStdString();
        } else {
            EXPECT_TRUE(hasFailed) << number;
            EXPECT_TRUE(state == before || state == otherwise || state == atWorst)
                << number << ": " << state.toStdString();
        }
        isEverThrown = isEverThrown || isThrown;
        // What is there can be used.
        if (subject.application.IsOpen(subject.other)) {
            subject.other->SetTitle(QStringLiteral("Title again"));
            EXPECT_EQ(static_cast<const UDocument *>(subject.other)->GetTitle(), QStringLiteral("Title again"));
        }
        return hasFailed && !HasFailure();
    }

    QString before;
    QString after;
    QString otherwise;
    QString atWorst;
    bool isEverThrown = false;
};

TEST_P(HostAllocations, AnyOfThemMayFail)
{
    {
        HostSubject subject;
        before = subject.state();
        EXPECT_TRUE(GetParam().act(subject)) << "it does not work at all";
        after = subject.state();
    }
    const auto stateAfter = [this](void (*change)(HostSubject &)) {
        HostSubject subject;
        if (change != nullptr) {
            change(subject);
        }
        return subject.state();
    };
    otherwise = stateAfter(GetParam().otherwise);
    atWorst = stateAfter(GetParam().atWorst);
    failingEachAllocation([this](qint64 number) { return attempt(number); });
    EXPECT_EQ(isEverThrown, GetParam().throws) << "what its header says";
}

INSTANTIATE_TEST_SUITE_P(Operations, HostAllocations, testing::ValuesIn(operations), [](const auto &operation) {
    std::string name;
    for (const char letter : std::string(operation.param.name)) {
        name += std::isalnum(static_cast<unsigned char>(letter)) != 0 ? std::string(1, letter) : std::string();
    }
    return name;
});

} // namespace

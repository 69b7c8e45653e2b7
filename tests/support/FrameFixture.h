#pragma once

#include "AppMessageBox.h"
#include "CViewPane.h"
#include "PrintQt.h"
#include "UApplication.h"
#include "UArchive.h"
#include "UDocTemplate.h"
#include "UDocument.h"
#include "UView.h"

#include <QByteArray>
#include <QFile>
#include <QFileInfo>
#include <QStringList>

#include <algorithm>
#include <memory>
#include <string>
#include <vector>

/// What happens to the documents and panes of one test. It outlives them, and closes the panes that a test leaves open.
class FrameLog
{
public:
    FrameLog() = default;
    ~FrameLog()
    {
        while (!panes.empty()) {
            panes.back()->ClosePane();
        }
    }
    FrameLog(const FrameLog &) = delete;
    FrameLog &operator=(const FrameLog &) = delete;

    int documents = 0;              ///< that live
    std::vector<CViewPane *> panes; ///< that live
    QStringList events;             ///< of all documents
};

/// A document whose content is a text, kept in its file as it is.
class TextDocument : public UDocument
{
public:
    explicit TextDocument(FrameLog &log) : log_(log) { ++log_.documents; }
    ~TextDocument() override { --log_.documents; }

    bool OnNewDocument() override { return makes && UDocument::OnNewDocument(); }
    void Serialize(UArchive &archive) override
    {
        archivePath = archive.GetFilePath();
        archiveLength = archive.GetLength();
        wasModifiedMeanwhile = IsModified();
        if (archive.IsStoring()) {
            archive.Write(content);
            return;
        }
        QFile file(archive.GetFilePath());
        content = file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
        if (content.startsWith("broken")) {
            archive.Write("a write into a file that is read fails");
        }
    }
    void DeleteContents() override { content.clear(); }
    void OnDocumentEvent(DocumentEvent event) override
    {
        static const char *const names[] = {"new", "open", "save", "close"};
        log_.events.append(QLatin1String(names[static_cast<int>(event)]));
    }
    using UDocument::CloseAllPanes;

    QByteArray content;
    bool makes = true; ///< whether it can be made new
    QString archivePath;
    qint64 archiveLength = -1;
    bool wasModifiedMeanwhile = false;

private:
    FrameLog &log_;
};

/// A view that keeps how it was updated.
class RecordingView : public UView
{
public:
    struct Update
    {
        UView *sender;
        long hint;
        void *hintObject;
        bool operator==(const Update &) const = default;
    };

    void OnUpdate(UView *sender, long hint, void *hintObject) override
    {
        updates.push_back({sender, hint, hintObject});
    }

    std::vector<Update> updates;
};

/// A pane that counts how often it is asked to show its title again.
class RecordingPane : public CViewPane
{
public:
    explicit RecordingPane(FrameLog &log) : log_(log) { log_.panes.push_back(this); }
    ~RecordingPane() override { std::erase(log_.panes, this); }

    void UpdateTitle() override { ++titleUpdates; }

    int titleUpdates = 0;

private:
    FrameLog &log_;
};

/// Puts a new view of a document into a pane.
inline RecordingView *addRecordingView(CViewPane &pane, UDocument &document)
{
    auto view = std::make_unique<RecordingView>();
    RecordingView *shown = view.get();
    pane.AddView(std::move(view));
    document.AddView(shown);
    return shown;
}

/// A visible pane with a view of a document.
inline RecordingPane *openRecordingPane(FrameLog &log, UDocument &document)
{
    auto *pane = new RecordingPane(log);
    pane->ShowPane(true);
    addRecordingView(*pane, document);
    document.UpdateFrameCounts();
    return pane;
}

inline RecordingView *viewOf(const CViewPane *pane, std::size_t index = 0)
{
    return static_cast<RecordingView *>(pane->GetViews().at(index).get());
}

inline QStringList paneCaptions()
{
    QStringList captions;
    CViewPane::GetPaneCaptions(captions);
    return captions;
}

/// An application with one document template. It must go before its log.
class TextApplication : public UApplication
{
public:
    explicit TextApplication(FrameLog &log, bool withWindows = true)
        : texts_(AddDocTemplate(std::make_unique<UDocTemplate>(
              128, [&log] { return std::make_unique<TextDocument>(log); },
              withWindows ? UDocTemplate::PaneFactory([&log] { return new RecordingPane(log); })
                          : UDocTemplate::PaneFactory(),
              withWindows ? UDocTemplate::ViewFactory([] { return std::make_unique<RecordingView>(); })
                          : UDocTemplate::ViewFactory(),
              QStringLiteral("Texts"), 1, 1)))
    {}

    UDocTemplate &texts() const { return *texts_; }
    TextDocument *open(const QString &path = QString(), CViewPane *pane = nullptr, int makeVisible = 1) const
    {
        return static_cast<TextDocument *>(
            texts_->OpenReportDocumentFile(path, makeVisible, makeVisible, pane, 0, nullptr));
    }

private:
    UDocTemplate *texts_;
};

/// Answers every message and keeps what was asked.
class AnsweredMessages
{
public:
    explicit AnsweredMessages(MessageAnswer answer)
    {
        kareport::setMessageHandler([this, answer](const QString &text, MessageButtons buttons) {
            texts.append(text);
            asked.push_back(buttons);
            return answer;
        });
    }
    ~AnsweredMessages() { kareport::setMessageHandler({}); }
    AnsweredMessages(const AnsweredMessages &) = delete;
    AnsweredMessages &operator=(const AnsweredMessages &) = delete;

    QStringList texts;
    std::vector<MessageButtons> asked;
};

inline std::string contentOf(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll().toStdString() : "(cannot be read)";
}

inline void putFile(const QString &path, const QByteArray &content)
{
    QFile file(path);
    if (file.open(QIODevice::WriteOnly)) {
        file.write(content);
    }
}

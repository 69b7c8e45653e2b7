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
    ~FrameLog();
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
    void Serialize(UArchive &archive) override;
    void DeleteContents() override { content.clear(); }
    void OnDocumentEvent(DocumentEvent event) override;
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

    void OnUpdate(UView *sender, long hint, void *hintObject) override;

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
RecordingView *addRecordingView(CViewPane &pane, UDocument &document);

/// A visible pane with a view of a document.
RecordingPane *openRecordingPane(FrameLog &log, UDocument &document);

RecordingView *viewOf(const CViewPane *pane, std::size_t index = 0);

QStringList paneCaptions();

/// An application with one document template. It must go before its log.
class TextApplication : public UApplication
{
public:
    explicit TextApplication(FrameLog &log, bool withWindows = true);

    UDocTemplate &texts() const { return *texts_; }
    TextDocument *open(const QString &path = QString(), CViewPane *pane = nullptr, int makeVisible = 1) const;

private:
    UDocTemplate *texts_;
};

/// Answers every message and keeps what was asked.
class AnsweredMessages
{
public:
    explicit AnsweredMessages(MessageAnswer answer);
    ~AnsweredMessages() { kareport::setMessageHandler({}); }
    AnsweredMessages(const AnsweredMessages &) = delete;
    AnsweredMessages &operator=(const AnsweredMessages &) = delete;

    QStringList texts;
    std::vector<MessageButtons> asked;
};

std::string contentOf(const QString &path);

void putFile(const QString &path, const QByteArray &content);

#include "FrameFixture.h"

FrameLog::~FrameLog()
{
    while (!panes.empty()) {
        panes.back()->ClosePane();
    }
}

void TextDocument::Serialize(UArchive &archive)
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

void TextDocument::OnDocumentEvent(DocumentEvent event)
{
    static const char *const names[] = {"new", "open", "save", "close"};
    log_.events.append(QLatin1String(names[static_cast<int>(event)]));
}

void RecordingView::OnUpdate(UView *sender, long hint, void *hintObject)
{
    updates.push_back({sender, hint, hintObject});
}

RecordingView *addRecordingView(CViewPane &pane, UDocument &document)
{
    auto view = std::make_unique<RecordingView>();
    RecordingView *shown = view.get();
    pane.AddView(std::move(view));
    document.AddView(shown);
    return shown;
}

RecordingPane *openRecordingPane(FrameLog &log, UDocument &document)
{
    auto *pane = new RecordingPane(log);
    pane->ShowPane(true);
    addRecordingView(*pane, document);
    document.UpdateFrameCounts();
    return pane;
}

RecordingView *viewOf(const CViewPane *pane, std::size_t index)
{
    return static_cast<RecordingView *>(pane->GetViews().at(index).get());
}

QStringList paneCaptions()
{
    QStringList captions;
    CViewPane::GetPaneCaptions(captions);
    return captions;
}

TextApplication::TextApplication(FrameLog &log, bool withWindows)
    : texts_(AddDocTemplate(std::make_unique<UDocTemplate>(
          128, [&log] { return std::make_unique<TextDocument>(log); },
          withWindows ? UDocTemplate::PaneFactory([&log] { return new RecordingPane(log); })
                      : UDocTemplate::PaneFactory(),
          withWindows ? UDocTemplate::ViewFactory([] { return std::make_unique<RecordingView>(); })
                      : UDocTemplate::ViewFactory(),
          QStringLiteral("Texts"), 1, 1)))
{}

TextDocument *TextApplication::open(const QString &path, CViewPane *pane, int makeVisible) const
{
    return static_cast<TextDocument *>(
        texts_->OpenReportDocumentFile(path, makeVisible, makeVisible, pane, 0, nullptr));
}

AnsweredMessages::AnsweredMessages(MessageAnswer answer)
{
    kareport::setMessageHandler([this, answer](const QString &text, MessageButtons buttons) {
        texts.append(text);
        asked.push_back(buttons);
        return answer;
    });
}

std::string contentOf(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll().toStdString() : "(cannot be read)";
}

void putFile(const QString &path, const QByteArray &content)
{
    QFile file(path);
    if (file.open(QIODevice::WriteOnly)) {
        file.write(content);
    }
}

// The file of a template, and the data that its pages are made with.
#include "AppMessageBox.h"
#include "ChangedFile.h"
#include "FileKind.h"
#include "OpenTemplate.h"
#include "ReplaceFile.h"
#include "TemplatePage.h"
#include "TemplateSource.h"
#include "TemplateTextEdit.h"
#include "TemplateWindow.h"
#include "ValueGuard.h"
#include "Xlate.h"

#include <QCloseEvent>
#include <QComboBox>
#include <QFile>
#include <QFileInfo>
#include <QIODevice>

namespace kareport
{

QString TemplateWindow::load(const QString &path)
{
    if (const QString problem = read(path); !problem.isEmpty()) {
        return problem;
    }
    data_ = rememberedData(path_);
    worker_ =
        std::make_unique<PreviewWorker>(path_, now_, [this](PreviewWorker::Answer &answer) { takeAnswer(answer); });
    fillDataChoice();
    setData(data_);
    return QString();
}

/// Reads a file into the text.
QString TemplateWindow::read(const QString &path)
{
    if (const auto wrong = wrongTemplateSource(path)) {
        return wrong->text;
    }
    watch_.expect(path);
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        watch_.ceaseToExpect(path);
        return file.errorString();
    }
    const QByteArray bytes = file.readAll();
    file_ = EditableText(bytes);
    path_ = path;
    {
        const ValueGuard loading(isLoading_, true, [this](bool on) { isLoading_ = on; });
        edit_->setPlainText(file_.text());
    }
    // Characters that the text of a window cannot hold would be lost.
    const bool isWhole = file_.bytesOf(edit_->wholeText()) == bytes;
    edit_->setReadOnly(!isWhole);
    if (!isWhole) {
        AppMessageBox(
            Xlate("\"%1\" has characters that cannot be shown here. It can be read, but not edited.").arg(path));
    }
    edit_->document()->setModified(false);
    watch_.watch(path_);
    showTitle();
    return QString();
}

void TemplateWindow::showTitle()
{
    setWindowFilePath(path_);
    setWindowTitle(QFileInfo(path_).fileName() + QStringLiteral("[*] – ") + Xlate("Template"));
    setWindowModified(edit_->document()->isModified());
}

bool TemplateWindow::save()
{
    return edit_->isReadOnly() ? saveAs() : writeTo(path_);
}

bool TemplateWindow::saveAs()
{
    const auto path = askSaveName();
    if (!path || !writeTo(*path)) {
        return false;
    }
    if (*path != path_) {
        watch_.forget(path_);
        path_ = QFileInfo(*path).absoluteFilePath();
        watch_.watch(path_);
        showTitle();
        worker_ =
            std::make_unique<PreviewWorker>(path_, now_, [this](PreviewWorker::Answer &answer) { takeAnswer(answer); });
        data_ = rememberedData(path_);
        fillDataChoice();
        setData(data_);
    }
    return true;
}

bool TemplateWindow::writeTo(const QString &path)
{
    const QString text = edit_->wholeText();
    const QByteArray bytes = file_.bytesOf(text);
    const bool changesEncoding = file_.changesEncoding(text);
    QString problem;
    if (!replaceFile(
            path, [&bytes](QIODevice &device) { return device.write(bytes) == bytes.size(); }, &problem))
    {
        AppMessageBox(Xlate("\"%1\" could not be saved: %2").arg(path, problem));
        return false;
    }
    if (path == path_) {
        watch_.watch(path_); // as it is now
    }
    file_ = EditableText(bytes);
    edit_->document()->setModified(false);
    if (changesEncoding) {
        AppMessageBox(Xlate("\"%1\" has characters that are not in Latin-1. It was saved as UTF-8.").arg(path));
    }
    return true;
}

bool TemplateWindow::mayDiscard()
{
    if (!edit_->document()->isModified()) {
        return true;
    }
    const MessageAnswer answer = kareport::showMessage({Xlate("Save changes to %1?").arg(QFileInfo(path_).fileName()),
                                                        QString(), MessageButtons::YesNoCancel, MessageIcon::Question});
    return answer == MessageAnswer::No || (answer == MessageAnswer::Yes && save());
}

void TemplateWindow::closeEvent(QCloseEvent *event)
{
    event->setAccepted(mayDiscard());
}

void TemplateWindow::fileChanged(const QString &path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly) || file.readAll() == file_.bytesOf(edit_->wholeText())) {
        return;
    }
    if (!askToLoadAgain(path, edit_->document()->isModified())) {
        edit_->document()->setModified(true); // what is shown is not in the file
        return;
    }
    const int line = edit_->textCursor().blockNumber() + 1;
    const int column = edit_->textCursor().positionInBlock() + 1;
    if (const QString problem = read(path); !problem.isEmpty()) {
        AppMessageBox(Xlate("\"%1\" could not be opened: %2").arg(path, problem));
        return;
    }
    goTo(line, column);
    requestPages();
}

void TemplateWindow::fillDataChoice()
{
    QStringList files = jobsOfTemplate(path_);
    if (!data_.isSample() && !files.contains(data_.file)) {
        files.append(data_.file);
    }
    dataChoice_->clear();
    dataChoice_->addItem(Xlate("Sample rows"));
    for (const QString &file : files) {
        dataChoice_->addItem(QFileInfo(file).fileName(), file);
    }
    dataChoice_->addItem(Xlate("Choose a job or a data file..."));
    dataChoice_->setCurrentIndex(data_.isSample() ? 0 : qMax(0, dataChoice_->findData(data_.file)));
}

void TemplateWindow::chooseData(int index)
{
    if (index == dataChoice_->count() - 1) {
        browseData();
        return;
    }
    const QString file = dataChoice_->itemData(index).toString();
    setData(file == data_.file ? data_ : dataOfFile(file));
}

void TemplateWindow::browseData()
{
    const auto file = askData();
    if (file) {
        setData(dataOfFile(*file));
    }
    fillDataChoice();
}

/// Rows of a text file are shown on the pages; any other file is opened.
void TemplateWindow::takeDropped(const QStringList &files)
{
    for (const QString &file : files) {
        const QString ending = QFileInfo(file).suffix().toLower();
        if (ending == u"csv" || ending == u"txt") {
            setData(dataOfFile(file));
        } else {
            openAnyFile(file);
        }
    }
}

/// A data file is written through the table or block that the cursor is in, or else through the template's first one.
TemplateData TemplateWindow::dataOfFile(const QString &file) const
{
    TemplateData data{file};
    if (file.isEmpty() || isJobFile(file)) {
        return data;
    }
    const TemplateOutline outline = outlineOf(edit_->wholeText());
    const qsizetype position = edit_->textCursor().position();
    const OutlineTemplate *here = outline.templateAt(position);
    if (here == nullptr || here->outputs.empty()) {
        return data;
    }
    const OutlineOutput *output = &here->outputs.front();
    for (const OutlineOutput &one : here->outputs) {
        output = one.element.touches(position) ? &one : output;
    }
    data.templateName = here->name.text;
    (output->isTable ? data.table : data.block) = output->name.text;
    return data;
}

void TemplateWindow::setData(const TemplateData &data)
{
    if (!(data == data_)) {
        rememberData(path_, data);
    }
    data_ = data;
    fillDataChoice();
    worker_->setData([data, path = path_]() -> std::optional<Expected<JsonSource>> {
        return data.isSample() ? std::nullopt : std::optional(data.source(path));
    });
    requestPages();
}

} // namespace kareport

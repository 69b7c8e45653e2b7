#include "PreviewWorker.h"

#include <QMetaObject>

#include <limits>
#include <new>
#include <system_error>
#include <utility>

namespace kareport
{

PreviewWorker::PreviewWorker(const QString &path, const QDateTime &now, std::function<void(Answer &)> answered)
    : preview_(path, now), answered_(std::move(answered))
{
    try {
        thread_ = std::thread([this] { run(); });
    } catch (const std::system_error &) {
        return; // pages are then made while a key is waited for
    }
}

PreviewWorker::~PreviewWorker()
{
    {
        const std::lock_guard lock(mutex_);
        isEnding_ = true;
        newest_ = std::numeric_limits<quint64>::max();
    }
    wanted_.notify_all();
    if (thread_.joinable()) {
        thread_.join();
    }
}

void PreviewWorker::setData(Data data)
{
    const std::lock_guard lock(mutex_);
    data_ = std::move(data);
}

void PreviewWorker::show(Request request)
{
    Work work;
    work.report = std::make_unique<PreviewReport>();
    std::optional<Work> passedOver; // its report is deleted here
    {
        const std::lock_guard lock(mutex_);
        newest_ = request.number;
        work.request = std::move(request);
        if (thread_.joinable()) {
            passedOver = std::exchange(next_, std::move(work));
        }
    }
    if (thread_.joinable()) {
        wanted_.notify_all();
    } else {
        carryOut(std::move(work));
    }
}

void PreviewWorker::run()
{
    for (;;) {
        std::unique_lock lock(mutex_);
        wanted_.wait(lock, [this] { return isEnding_ || next_; });
        if (isEnding_) {
            return;
        }
        Work work = std::move(*next_);
        next_.reset();
        lock.unlock();
        carryOut(std::move(work));
    }
}

void PreviewWorker::carryOut(Work work)
{
    {
        const std::lock_guard lock(mutex_);
        work.data = std::exchange(data_, std::nullopt);
    }
    if (work.data) {
        const auto source = (*work.data)();
        dataProblem_.reset();
        if (source) {
            dataProblem_ = preview_.useJob(*source);
        }
        if (!source || dataProblem_) {
            preview_.useSamples();
        }
        dataFiles_ = preview_.dataFiles();
    }
    const Request &request = work.request;
    const auto isStopped = [this, number = request.number] { return newest_ > number; };
    Answer pages;
    pages.number = request.number;
    pages.result = preview_.make(request.text, request.bytes, request.templateName, *work.report, isStopped,
                                 request.outline.get());
    pages.text = request.text;
    pages.jobTemplate = preview_.jobTemplate();
    pages.dataProblem = dataProblem_;
    pages.dataFiles = dataFiles_;
    pages.report = std::move(work.report);
    answer(std::move(pages));
    if (isStopped()) {
        return;
    }
    Answer remarks;
    remarks.number = request.number;
    remarks.areRemarks = true;
    try {
        remarks.remarks = TemplatePreview::remarksOn(request.text);
    } catch (const std::bad_alloc &) {
        return; // those before stay
    }
    answer(std::move(remarks));
}

/// Hands an answer to the thread of the windows.
void PreviewWorker::answer(Answer made)
{
    {
        const std::lock_guard lock(mutex_);
        answers_.push_back(std::move(made));
    }
    QMetaObject::invokeMethod(
        &receiver_, [this] { takeAnswers(); }, Qt::QueuedConnection);
}

void PreviewWorker::takeAnswers()
{
    std::vector<Answer> answers;
    {
        const std::lock_guard lock(mutex_);
        answers = std::exchange(answers_, {});
    }
    for (Answer &one : answers) {
        answered_(one);
    }
}

} // namespace kareport

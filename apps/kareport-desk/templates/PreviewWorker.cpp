#include "PreviewWorker.h"

#include <QMetaObject>

#include <limits>
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
        lastNumber_ = request.number;
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
    Answer answer;
    answer.number = work.request.number;
    answer.result = preview_.make(work.request.text, work.request.bytes, work.request.templateName, *work.report,
                                  [this, number = work.request.number] { return newest_ > number; });
    answer.text = std::move(work.request.text);
    answer.jobTemplate = preview_.jobTemplate();
    answer.dataProblem = dataProblem_;
    answer.dataFiles = dataFiles_;
    answer.report = std::move(work.report);
    {
        const std::lock_guard lock(mutex_);
        answers_.push_back(std::move(answer));
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
    for (Answer &answer : answers) {
        answeredNumber_ = answer.number;
        answered_(answer);
    }
}

} // namespace kareport

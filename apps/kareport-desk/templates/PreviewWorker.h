#pragma once

#include "TemplatePreview.h"

#include <QByteArray>
#include <QDateTime>
#include <QObject>
#include <QString>
#include <QStringList>

#include <atomic>
#include <condition_variable>
#include <functional>
#include <memory>
#include <mutex>
#include <optional>
#include <thread>
#include <vector>

namespace kareport
{

/// Makes the pages of a template on another thread. What was asked for last counts: earlier work is stopped.
class PreviewWorker
{
public:
    /// What is to be shown.
    struct Request
    {
        quint64 number = 0;
        QString text;
        QByteArray bytes;
        QString templateName;                           ///< that samples are shown of
        std::shared_ptr<const TemplateOutline> outline; ///< of the text
    };
    struct Answer
    {
        quint64 number = 0; ///< of the request
        QString text;
        bool areRemarks = false; ///< they follow the pages, which are waited for more
        std::vector<TemplateRemark> remarks;
        PreviewResult result;                  ///< of an answer that has no remarks
        QString jobTemplate;                   ///< that the job shows; empty for samples
        std::optional<InputError> dataProblem; ///< with the data that was to be shown from this answer on
        QStringList dataFiles;                 ///< that the pages depend on
        std::unique_ptr<PreviewReport> report; ///< is deleted by the thread of the windows
    };
    /// Gives the job whose data is to be shown; nothing for samples. It is called on the other thread.
    using Data = std::function<std::optional<Expected<JsonSource>>()>;

    /// @param path  of the template, @param answered  is called on this thread
    PreviewWorker(const QString &path, const QDateTime &now, std::function<void(Answer &)> answered);
    ~PreviewWorker();
    PreviewWorker(const PreviewWorker &) = delete;
    PreviewWorker &operator=(const PreviewWorker &) = delete;

    void show(Request request);
    /// Sets the data of what is shown next, which is read again. A request has to follow.
    void setData(Data data);

private:
    struct Work
    {
        Request request;
        std::optional<Data> data;
        std::unique_ptr<PreviewReport> report;
    };

    void run();
    void carryOut(Work work);
    void answer(Answer made);
    void takeAnswers();

    TemplatePreview preview_;
    std::optional<InputError> dataProblem_;
    QStringList dataFiles_;
    std::function<void(Answer &)> answered_;
    QObject receiver_; ///< of the events that bring answers
    std::mutex mutex_;
    std::condition_variable wanted_;
    std::optional<Work> next_;
    std::optional<Data> data_; ///< for the next work
    std::vector<Answer> answers_;
    std::atomic<quint64> newest_ = 0; ///< work for an earlier request is stopped
    bool isEnding_ = false;
    std::thread thread_; ///< last: it begins when all else is there
};

} // namespace kareport

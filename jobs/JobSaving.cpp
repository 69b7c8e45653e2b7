#include "JobSaving.h"

#include "DataKind.h"
#include "JobFiles.h"
#include "JobSettings.h"
#include "ReplaceFile.h"
#include "Xlate.h"

#include <QDir>
#include <QFileInfo>
#include <QJsonArray>
#include <QJsonDocument>

namespace kareport
{

namespace
{

const QString pageKey = QStringLiteral("page");
const QString settingsKey = QStringLiteral("settings");
const QString templateKey = QStringLiteral("template");
const QString dataKey = QStringLiteral("data");
const QString outputKey = QStringLiteral("output");

/// The folder as the system knows it: a way that leads up through a link would lead elsewhere.
QString realFolder(const QString &folder)
{
    const QString real = QFileInfo(folder).canonicalFilePath();
    return real.isEmpty() ? QFileInfo(folder).absoluteFilePath() : real;
}

/// The name of a file for a job in a folder.
QString nameFrom(const QString &folder, const QString &file)
{
    const QFileInfo info(file);
    const QString name =
        QDir(realFolder(folder)).relativeFilePath(QDir(realFolder(info.absolutePath())).filePath(info.fileName()));
    return name == u"-" ? QStringLiteral("./-") : name; // which would be standard input
}

/// An installed template keeps its name, as far as no other file is found by it.
QString templateName(const QString &given, const QString &file, const QString &folder, const JobDefaults &defaults)
{
    const QString installed = QDir(defaults.templateFolder).filePath(given);
    const bool isInstalled = QFileInfo(installed).absoluteFilePath() == QFileInfo(file).absoluteFilePath();
    return isInstalled && !QFileInfo::exists(QDir(folder).filePath(given)) ? given : nameFrom(folder, file);
}

/// What the job does not say of the page, and the program does.
QJsonObject pageOf(QJsonObject page, const Job::Page &known)
{
    const auto add = [&page](const QString &key, const QJsonValue &value) {
        if (!page.contains(key)) {
            page.insert(key, value);
        }
    };
    add(QStringLiteral("paper"), paperKey(known.printer.paper));
    add(QStringLiteral("orientation"), known.portrait ? QStringLiteral("portrait") : QStringLiteral("landscape"));
    if (known.margins) {
        const QMargins &margins = *known.margins;
        add(QStringLiteral("margins"), QJsonArray{margins.left(), margins.top(), margins.right(), margins.bottom()});
    }
    if (known.fontName) {
        add(QStringLiteral("fontName"), *known.fontName);
    }
    if (known.fontSize) {
        add(QStringLiteral("fontSize"), *known.fontSize);
    }
    return page;
}

/// The data sets with the names of their files as they are from a folder.
QJsonObject dataFrom(const QString &folder, QJsonObject data, const Job &job)
{
    for (auto set = job.data.constBegin(); set != job.data.constEnd(); ++set) {
        const QStringList files = set->source->files();
        if (!files.isEmpty()) { // the first one is that which the job names
            QJsonObject object = data.value(set.key()).toObject();
            object.insert(set->kind, nameFrom(folder, files.first()));
            data.insert(set.key(), object);
        }
    }
    return data;
}

/// The members of an object in the order in which people read them.
QByteArray textOf(const QJsonObject &job)
{
    QStringList keys;
    for (const char *key : {"title", "application", "strict", "header", "now", "page", "settings", "template",
                            "options", "data", "report", "output", "pdf"})
    {
        keys.append(QLatin1StringView(key));
    }
    QByteArray text;
    for (const QString &key : keys) {
        if (job.contains(key)) {
            const QByteArray member = QJsonDocument(QJsonObject{{key, job.value(key)}}).toJson();
            // Without the braces around it, "{\n" and "\n}\n".
            text += (text.isEmpty() ? QByteArray() : QByteArray(",\n")) + member.sliced(2, member.size() - 5);
        }
    }
    return "{\n" + text + "\n}\n";
}

/// What keeps a job from being in a file.
std::optional<InputError> wrongPlace(const Job &job, const QString &path)
{
    // Its own job file may be replaced.
    std::vector<Output> files;
    files.push_back({path, OutputKind::Text});
    const auto clash = outputClash(job, files, QString());
    return clash ? std::optional(InputError{path, std::nullopt, clash->text}) : std::nullopt;
}

/// What is wrong with a job that is going to be written.
std::optional<InputError> wrongJob(const QByteArray &text, const JobDefaults &defaults, const QString &path)
{
    const auto read = JsonSource::fromBytes(path, text);
    if (const InputError *wrong = errorOf(read)) {
        return *wrong;
    }
    JobDefaults elsewhere;
    elsewhere.templateFolder = defaults.templateFolder;
    const auto job = readJob(std::get<JsonSource>(read), elsewhere);
    if (const InputError *wrong = errorOf(job)) {
        return *wrong;
    }
    const auto clash = outputClash(std::get<Job>(job), path);
    return clash ? std::optional(InputError{path, std::nullopt, clash->text}) : std::nullopt;
}

} // namespace

Expected<QByteArray> jobFileOf(const ReportRecipe &recipe, const JobDefaults &defaults, const QString &path)
{
    const auto read = sourceOf(recipe);
    if (const InputError *wrong = errorOf(read)) {
        return *wrong;
    }
    const auto &source = std::get<JsonSource>(read);
    const auto known = readJob(source, defaults);
    if (const InputError *wrong = errorOf(known)) {
        return *wrong;
    }
    const auto &job = std::get<Job>(known);
    if (const auto wrong = wrongPlace(job, path)) {
        return *wrong;
    }
    const QString folder = QFileInfo(path).absolutePath();
    QJsonObject root = source.root().toObject();
    root.insert(pageKey, pageOf(root.value(pageKey).toObject(), job.page));
    root.insert(settingsKey, settingsToJson(job.settings));
    if (!job.data.isEmpty()) {
        root.insert(dataKey, dataFrom(folder, root.value(dataKey).toObject(), job));
    }
    if (job.reportTemplate) {
        QJsonObject used = root.value(templateKey).toObject();
        const QString file = QStringLiteral("file");
        used.insert(file, templateName(used.value(file).toString(), job.reportTemplate->file, folder, defaults));
        root.insert(templateKey, used);
    }
    if (recipe.jobFile().isEmpty()) {
        root.insert(outputKey, QJsonArray{QFileInfo(path).completeBaseName() + QStringLiteral(".pdf")});
    }
    const QByteArray text = textOf(root);
    if (const auto wrong = wrongJob(text, defaults, path)) {
        return *wrong;
    }
    return text;
}

std::optional<InputError> saveJob(const ReportRecipe &recipe, const JobDefaults &defaults, const QString &path)
{
    const auto made = jobFileOf(recipe, defaults, path);
    if (const InputError *wrong = errorOf(made)) {
        return *wrong;
    }
    const auto &text = std::get<QByteArray>(made);
    QString problem;
    if (replaceFile(
            path, [&text](QIODevice &device) { return device.write(text) == text.size(); }, &problem))
    {
        return std::nullopt;
    }
    return InputError{path, std::nullopt, Xlate("the file could not be written: %1").arg(problem)};
}

} // namespace kareport

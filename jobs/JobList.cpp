#include "JobList.h"

#include "FileBytes.h"
#include "JsonPlaces.h"
#include "StandardInput.h"
#include "SystemPath.h"
#include "Xlate.h"

#include <limits>

namespace kareport
{

std::optional<JobSlice> JobSlice::fromText(const QString &text)
{
    const qsizetype slash = text.indexOf(u'/');
    // Digits alone: a number may otherwise have blanks around it and a sign.
    const auto number = [](QStringView digits) -> std::optional<qsizetype> {
        for (const QChar digit : digits) {
            if (digit < u'0' || digit > u'9') {
                return std::nullopt;
            }
        }
        bool isNumber = false;
        const qlonglong value = digits.toLongLong(&isNumber);
        return isNumber && value > 0 ? std::optional(static_cast<qsizetype>(value)) : std::nullopt;
    };
    if (slash < 0) {
        return std::nullopt;
    }
    const auto first = number(QStringView(text).first(slash));
    const auto count = number(QStringView(text).sliced(slash + 1));
    return first && count && *first <= *count ? std::optional(JobSlice{*first, *count}) : std::nullopt;
}

QStringList JobSlice::of(const QStringList &jobs) const
{
    QStringList taken;
    for (qsizetype i = number - 1; i < jobs.size(); i += count) {
        taken.append(jobs[i]);
        if (jobs.size() - i <= count) {
            break; // the next step could be beyond what a number holds
        }
    }
    return taken;
}

Expected<QStringList> readJobList(const QString &path)
{
    QByteArray bytes;
    if (path == u"-") {
        const StandardInput input = StandardInput::read(std::numeric_limits<std::size_t>::max());
        if (input.error != 0) {
            return InputError{QString(), std::nullopt,
                              Xlate("standard input cannot be read: %1").arg(qt_error_string(input.error))};
        }
        bytes = input.bytes;
    } else {
        const auto file = FileBytes::open(path);
        if (const InputError *error = errorOf(file)) {
            return InputError{path, std::nullopt, Xlate("the list of jobs cannot be read: %1").arg(error->text)};
        }
        const std::string_view view = std::get<std::shared_ptr<const FileBytes>>(file)->view();
        bytes = QByteArray(view.data(), static_cast<qsizetype>(view.size()));
    }
    // A character 0 inside a line would part its name, and neither half is the file that is meant.
    const qsizetype lastZero = bytes.lastIndexOf('\0');
    if (lastZero >= 0 && bytes.contains('\n') && !bytes.sliced(lastZero + 1).trimmed().isEmpty()) {
        return InputError{
            path == u"-" ? QString() : path, placeOfByte(bytes, bytes.indexOf('\0')),
            Xlate(
                "the list of jobs contains both line breaks and NUL characters: either one name per line or a NUL character after each name was expected")};
    }
    const char separator = bytes.contains('\0') ? '\0' : '\n';
    QStringList jobs;
    for (QByteArray &name : bytes.split(separator)) {
        if (separator == '\n' && name.endsWith('\r')) {
            name.chop(1);
        }
        if (!name.trimmed().isEmpty()) {
            jobs.append(textOfSystem(name));
        }
    }
    return jobs;
}

} // namespace kareport

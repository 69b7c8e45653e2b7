#include "TextFile.h"

#include "FileBytes.h"
#include "MemoryLasts.h"
#include "StandardText.h"
#include "Xlate.h"

#include <QFileInfo>

#include <string_view>

namespace kareport
{

namespace
{

/// A shorter file is read before the user notices.
constexpr qint64 shortestAside = qint64(8) << 20;

TextFile::State stateOf(TextLoading loading)
{
    switch (loading) {
    case TextLoading::Whole: return TextFile::State::Whole;
    case TextLoading::OtherText: return TextFile::State::OtherText;
    case TextLoading::Stopped: return TextFile::State::Stopped;
    default: return TextFile::State::NotRead;
    }
}

TextFile::State readInto(TextFile &read, const QString &path, const LoadText &load, AsideState &state)
{
    const auto file = FileBytes::open(path);
    if (const InputError *error = errorOf(file)) {
        read.problem = error->text;
        return TextFile::State::NotRead;
    }
    const FileBytes &bytes = *std::get<std::shared_ptr<const FileBytes>>(file);
    const std::string_view view = bytes.view();
    const auto size = static_cast<qsizetype>(view.size());
    const TextLoading loading = load(QByteArrayView(view.data(), size), *read.text, [&state, size](qint64 done) {
        state.setPercent(static_cast<int>(done * 100 / size));
        return !state.isStopped();
    });
    if (const auto lost = bytes.lostBytes()) {
        read.problem = lost->text; // what is left of the file is not what was saved
        return TextFile::State::NotRead;
    }
    read.problem = loading == TextLoading::NoMemory ? noMemoryText() : QString();
    return stateOf(loading);
}

TextFile readNow(const QString &path, const LoadText &load, AsideState &state)
{
    TextFile read;
    const bool isDone = doneWhileMemoryLasts([&] {
        read.text = std::make_unique<LoadedText>();
        read.state = readInto(read, path, load, state);
    });
    if (read.state != TextFile::State::Whole) {
        read.text.reset();
    }
    if (!isDone) {
        doneWhileMemoryLasts([&read] { read.problem = noMemoryText(); });
    }
    return read;
}

} // namespace

TextFile readTextFile(const QString &path, UserInput input, const LoadText &load)
{
    const QFileInfo file(path);
    if (file.size() < shortestAside) {
        AsideState state;
        return readNow(path, load, state);
    }
    const auto read = std::make_shared<TextFile>(); // which the thread may outlive
    const bool isDone = doAside(Xlate("Reading %1").arg(file.fileName()), input,
                                [read, path, load](AsideState &state) { *read = readNow(path, load, state); });
    return isDone ? std::move(*read) : TextFile{TextFile::State::Stopped, nullptr};
}

} // namespace kareport

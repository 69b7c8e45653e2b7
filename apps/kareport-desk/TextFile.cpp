#include "TextFile.h"

#include "FileBytes.h"
#include "MemoryLasts.h"
#include "Xlate.h"

#include <QFileInfo>

#include <string_view>

namespace kareport
{

namespace
{

/// A shorter file is read before anybody notices.
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

TextFile::State readInto(LoadedText &loaded, const QString &path, const LoadText &load, AsideState &state)
{
    const auto file = FileBytes::open(path);
    if (errorOf(file) != nullptr) {
        return TextFile::State::NotRead;
    }
    const FileBytes &bytes = *std::get<std::shared_ptr<const FileBytes>>(file);
    const std::string_view view = bytes.view();
    const auto size = static_cast<qsizetype>(view.size());
    const TextLoading loading = load(QByteArrayView(view.data(), size), loaded, [&state, size](qint64 done) {
        state.setPercent(static_cast<int>(done * 100 / size));
        return !state.isStopped();
    });
    // What is left of a file that was cut short is not what was saved.
    return bytes.lostBytes() ? TextFile::State::NotRead : stateOf(loading);
}

TextFile readNow(const QString &path, const LoadText &load, AsideState &state)
{
    TextFile read;
    read.state = whileMemoryLasts(TextFile::State::NotRead, [&] {
        read.text = std::make_unique<LoadedText>();
        return readInto(*read.text, path, load, state);
    });
    if (read.state != TextFile::State::Whole) {
        read.text.reset();
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

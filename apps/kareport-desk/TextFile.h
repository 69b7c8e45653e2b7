#pragma once

#include "LoadedText.h"
#include "WorkAside.h"

#include <QString>

#include <functional>
#include <memory>

namespace kareport
{

/// What became of reading a report's text from a file.
struct TextFile
{
    enum class State
    {
        Whole,
        OtherText, ///< what was read is not such a text
        Stopped,   ///< by the user
        NotRead    ///< the file cannot be read, was cut short meanwhile, or there is no memory for it
    };

    State state = State::NotRead;
    std::unique_ptr<LoadedText> text; ///< null unless all of it was read
    QString problem = {};             ///< why it was not read, as a part of a sentence
};

/// Turns a file's bytes into a text, on any thread.
using LoadText = std::function<TextLoading(QByteArrayView bytes, LoadedText &loaded,
                                           const std::function<bool(qint64 done)> &proceed)>;

/// Reads a file. The windows answer while a long one is read, which the user can stop.
TextFile readTextFile(const QString &path, UserInput input, const LoadText &load);

} // namespace kareport

#pragma once

#include "FailingMemory.h"
#include "PageWriter.h"
#include "ReportTextCodec.h"
#include "ShortenedSteps.h"

#include <QBuffer>
#include <QString>

#include <cstddef>
#include <cstdint>
#include <optional>
#include <random>
#include <string>
#include <vector>

/// Sequences of operations on the text of a report, and what a plain string makes of them.
namespace textstore
{

enum class Op
{
    Write,        ///< letters at the end
    WriteOneByte, ///< the same, given with one byte a character
    WriteOwn,     ///< a piece of the text itself at its end
    LineEnd,
    Replace,
    ReplaceOutside, ///< a piece that is not in the text
    ReplaceByOwn,   ///< by a piece of the text itself
    Reserve,
    Truncate,
    Set,
    SetOwn, ///< to a piece of the text itself
    Clear,
    Widen,
    ReadWhole,
    ReadPiece,
    Stream,    ///< the text goes to an outlet from now on
    Drain,     ///< what there is of it
    EndStream, ///< and what was taken is compared
};
constexpr const char *opNames[] = {"Write",        "WriteOneByte", "WriteOwn",  "LineEnd", "Replace", "ReplaceOutside",
                                   "ReplaceByOwn", "Reserve",      "Truncate",  "Set",     "SetOwn",  "Clear",
                                   "Widen",        "ReadWhole",    "ReadPiece", "Stream",  "Drain",   "EndStream"};
constexpr int opCount = static_cast<int>(std::size(opNames));

enum class Letters
{
    OneByte,
    TwoBytes ///< also halves of pairs
};

struct Step
{
    Op op;
    qint64 at;      ///< a place in the text, whatever its length is by then; below 0 from its end
    qint64 removed; ///< characters
    qint64 count;   ///< characters
    Letters letters;
    int refused; ///< which request for memory is refused, as `FailingMemory::refuse` takes it
};

/// A step as a row of a table of steps.
std::string rowOf(const Step &step);

/// Characters of which no two neighbours are alike, none of them 0, and that differ from step to step.
QString lettersOf(Letters kind, qint64 count, quint64 salt);

/// A text that is given steps, together with a plain string that is given the same.
class Run
{
public:
    /// Carries a step out. @return what is wrong after it
    std::optional<std::string> take(const Step &step);

private:
    kareport::ReportText &text() { return page_.text(); }
    const kareport::ReportText &text() const { return page_.text(); }

    void expect(bool holds, const char *what);

    qint64 place(qint64 at) const;
    qint64 rest(qint64 at, qint64 count) const { return count % (model_.size() - at + 1); }

    /// What an operation that needs memory answered: false only where memory ran out.
    bool answered(bool answer);

    void carryOut(const Step &step);

    void read(const Step &step, qint64 at, qint64 count);

    void noteWritten(bool isWritten, QStringView letters);
    void write(const Step &step, const QString &letters);
    void writeOneByte(const Step &step);
    void writeOwn(const Step &step, qint64 at, qint64 count);
    void endLine(const Step &step);
    void replace(const Step &step, qint64 at, qint64 removed, const QString &letters);
    void replaceByOwn(const Step &step, qint64 at, qint64 removed);

    void noteTaken();
    void endStream();

    /// What holds after every step. Nothing is moved or carried out for it: that would hide what comes next.
    void check();

    struct OpenBuffer : QBuffer
    {
        OpenBuffer() { open(QIODevice::WriteOnly); }
    };

    kareport::PageWriter page_{nullptr, FailingMemory::reallocate};
    QString model_; ///< what the text is
    OpenBuffer device_;
    std::optional<kareport::ReportTextWriter> writer_;
    QString taken_; ///< what the outlet has got
    quint64 steps_ = 0;
    std::optional<std::string> wrong_;
};

/// What goes wrong in a sequence, and at which of its steps.
struct Violation
{
    std::size_t step;
    std::string what;
};

std::optional<Violation> violationOf(const std::vector<Step> &steps);

/// The simpler forms of a step, the simplest first.
std::vector<Step> simplerSteps(const Step &step);

/// The same violation in as few and as simple steps as can be found.
std::vector<Step> shortest(const std::vector<Step> &steps);

/// A sequence as the rows of a table, with what goes wrong in it.
std::string reportOf(const std::vector<Step> &steps);

/// A sequence of operations that is the same for the same seed everywhere.
class RandomSteps
{
public:
    explicit RandomSteps(quint64 seed) : random_(seed) {}

    std::vector<Step> make(std::size_t count);

private:
    static constexpr qint64 block = kareport::ReportText::blockSize;

    // The standard's distributions differ from library to library.
    qint64 below(qint64 end) { return static_cast<qint64>(random_() % static_cast<quint64>(end)); }

    Op op();
    qint64 length();
    qint64 place();

    std::mt19937_64 random_;
};

/// The sequence that some bytes mean, for a search that is led by what the code does.
std::vector<Step> stepsOf(const std::uint8_t *data, std::size_t size);

} // namespace textstore

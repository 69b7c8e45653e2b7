#include "TextStoreModel.h"

namespace textstore
{

std::string rowOf(const Step &step)
{
    return std::string("{Op::") + opNames[static_cast<int>(step.op)] + ", " + std::to_string(step.at) + ", " +
           std::to_string(step.removed) + ", " + std::to_string(step.count) +
           (step.letters == Letters::OneByte ? ", Letters::OneByte, " : ", Letters::TwoBytes, ") +
           std::to_string(step.refused) + "},\n";
}

QString lettersOf(Letters kind, qint64 count, quint64 salt)
{
    QString text(count, Qt::Uninitialized);
    for (qint64 i = 0; i < count; ++i) {
        const quint64 code = (salt * 37 + static_cast<quint64>(i)) % 251;
        char16_t letter = static_cast<char16_t>(1 + code);
        if (kind == Letters::TwoBytes && code % 5 == 0) {
            letter = static_cast<char16_t>(code % 2 == 0 ? 0xD83D : 0x4E00 + code);
        } else if (kind == Letters::TwoBytes && code % 5 == 1) {
            letter = static_cast<char16_t>(0xDE00 + code);
        }
        text[i] = QChar(letter);
    }
    return text;
}

std::optional<std::string> Run::take(const Step &step)
{
    ++steps_;
    wrong_.reset();
    FailingMemory::refuse(0);
    carryOut(step);
    FailingMemory::refuse(0);
    check();
    return wrong_;
}

void Run::expect(bool holds, const char *what)
{
    if (!holds && !wrong_) {
        wrong_ = what;
    }
}

qint64 Run::place(qint64 at) const
{
    const qint64 places = model_.size() + 1;
    return at >= 0 ? at % places : places - 1 - (-(at + 1)) % places;
}

bool Run::answered(bool answer)
{
    expect(answer || FailingMemory::hasRefused, "it answers false although there is memory");
    return answer;
}

void Run::carryOut(const Step &step)
{
    const qint64 at = place(step.at);
    const qint64 removed = rest(at, step.removed);
    switch (step.op) {
    case Op::Write: write(step, lettersOf(step.letters, step.count, steps_)); break;
    case Op::WriteOneByte: writeOneByte(step); break;
    case Op::WriteOwn: writeOwn(step, at, removed); break;
    case Op::LineEnd: endLine(step); break;
    case Op::Replace: replace(step, at, removed, lettersOf(step.letters, step.count, steps_)); break;
    case Op::ReplaceOutside:
        expect(!text().replace(at, model_.size() - at + 1, u"x"), "a piece outside the text is replaced");
        expect(!text().replace(-1, 0, u"x"), "a piece before the text is replaced");
        break;
    case Op::ReplaceByOwn: replaceByOwn(step, at, removed); break;
    case Op::Reserve:
        FailingMemory::refuse(step.refused);
        answered(text().reserve(step.count));
        break;
    case Op::Truncate:
        text().truncate(at);
        model_.truncate(at);
        break;
    case Op::Set: {
        const QString letters = lettersOf(step.letters, step.count, steps_);
        FailingMemory::refuse(step.refused);
        model_ = answered(text().assign(letters)) ? letters : QString();
        break;
    }
    case Op::SetOwn: {
        const QStringView own = text().view().sliced(at, removed);
        FailingMemory::refuse(step.refused);
        expect(text().assign(own), "a piece of the text needs memory to be all of it");
        model_ = model_.sliced(at, removed);
        break;
    }
    case Op::Clear:
        FailingMemory::refuse(step.refused);
        page_.clear();
        model_.clear();
        expect(!page_.hasLostText(), "an emptied text has lost something");
        break;
    default: read(step, at, removed); break;
    }
}

void Run::read(const Step &step, qint64 at, qint64 count)
{
    switch (step.op) {
    case Op::Widen: {
        FailingMemory::refuse(step.refused);
        const char16_t *data = text().data();
        const bool isWide = answered(!text().isNarrow());
        expect(data[isWide ? model_.size() : 0] == 0, "no 0 after the text");
        break;
    }
    case Op::ReadWhole:
        expect(text().isNarrow() ? text().narrowView() == model_ : text().view() == model_, "it reads otherwise");
        expect(text().isNarrow() ? text().narrowView().data()[model_.size()] == 0
                                 : text().view().utf16()[model_.size()] == 0,
               "no 0 after the text");
        break;
    case Op::ReadPiece: {
        const QStringView expected = QStringView(model_).sliced(at, count);
        expect(text().isNarrow() ? text().narrowView().sliced(at, count) == expected
                                 : text().view().sliced(at, count) == expected,
               "a piece reads otherwise");
        break;
    }
    case Op::Stream:
        if (!writer_) {
            writer_.emplace(device_, kareport::LineEnds::ReportFile);
            page_.setOutlet(&*writer_);
        }
        break;
    case Op::Drain:
        if (writer_) {
            expect(page_.emptyIntoOutlet(), "the outlet does not take the text");
            noteTaken();
        }
        break;
    case Op::EndStream: endStream(); break;
    default: break;
    }
}

void Run::noteWritten(bool isWritten, QStringView letters)
{
    if (!answered(isWritten)) {
        expect(page_.hasLostText(), "a loss is not known");
        return;
    }
    model_ += letters;
    if (writer_ && model_.size() >= kareport::PageWriter::mostBeforeOutlet) {
        noteTaken();
    }
}

void Run::write(const Step &step, const QString &letters)
{
    FailingMemory::refuse(step.refused);
    noteWritten(page_.write(QStringView(letters), 0), letters);
}

void Run::writeOneByte(const Step &step)
{
    const QString letters = lettersOf(Letters::OneByte, step.count, steps_);
    const QByteArray bytes = letters.toLatin1();
    FailingMemory::refuse(step.refused);
    noteWritten(page_.write(QLatin1StringView(bytes), 0), letters);
}

void Run::writeOwn(const Step &step, qint64 at, qint64 count)
{
    const QString letters = model_.sliced(at, count);
    if (text().isNarrow()) {
        const QLatin1StringView own = text().narrowView().sliced(at, count);
        FailingMemory::refuse(step.refused);
        noteWritten(page_.write(own, 0), letters);
    } else {
        const QStringView own = text().view().sliced(at, count);
        FailingMemory::refuse(step.refused);
        noteWritten(page_.write(own, 0), letters);
    }
}

void Run::endLine(const Step &step)
{
    const qint64 before = page_.lineNumber();
    FailingMemory::refuse(step.refused);
    page_.lineFeed(1);
    noteWritten(page_.lineNumber() > before, u"\r\n");
}

void Run::replace(const Step &step, qint64 at, qint64 removed, const QString &letters)
{
    FailingMemory::refuse(step.refused);
    if (answered(text().replace(at, removed, letters))) {
        model_.replace(at, removed, letters);
    }
}

void Run::replaceByOwn(const Step &step, qint64 at, qint64 removed)
{
    const QStringView all = text().view();
    const QStringView own = all.first(rest(0, step.count));
    const QString letters = own.toString();
    FailingMemory::refuse(step.refused);
    if (answered(text().replace(at, removed, own))) {
        model_.replace(at, removed, letters);
    }
}

void Run::noteTaken()
{
    taken_ += model_;
    model_.clear();
}

void Run::endStream()
{
    if (!writer_) {
        return;
    }
    expect(page_.emptyIntoOutlet(), "the outlet does not take the text");
    noteTaken();
    page_.setOutlet(nullptr);
    expect(writer_->finish(), "the outlet does not end");
    QBuffer expected;
    expected.open(QIODevice::WriteOnly);
    kareport::writeReportText(expected, QStringView(taken_), kareport::LineEnds::ReportFile);
    expect(device_.data() == expected.data(), "the outlet has got something else");
    writer_.reset();
    taken_.clear();
    device_.buffer().clear();
    device_.seek(0);
}

void Run::check()
{
    expect(text().size() == model_.size(), "the size is another");
    expect(text().isEmpty() == model_.isEmpty(), "whether it is empty is another");
    qint64 at = 0;
    bool isEqual = true;
    text().forEachPiece([&](auto piece) {
        isEqual =
            isEqual && piece.size() <= model_.size() - at && piece == QStringView(model_).sliced(at, piece.size());
        at += piece.size();
    });
    expect(isEqual && at == model_.size(), "the text is another");
}

std::optional<Violation> violationOf(const std::vector<Step> &steps)
{
    FailingMemory::refuse(0);
    Run run;
    for (std::size_t i = 0; i < steps.size(); ++i) {
        if (const auto wrong = run.take(steps[i])) {
            return Violation{i, *wrong};
        }
    }
    return std::nullopt;
}

std::vector<Step> simplerSteps(const Step &step)
{
    std::vector<Step> forms;
    const auto add = [&forms, &step](auto change) {
        Step form = step;
        change(form);
        if (rowOf(form) != rowOf(step)) {
            forms.push_back(form);
        }
    };
    add([](Step &s) { s = {s.op, 0, 0, 1, Letters::OneByte, 0}; });
    add([](Step &s) { s = {s.op, 0, 0, s.count, Letters::OneByte, 0}; });
    add([](Step &s) { s = {s.op, s.at, 0, s.count, Letters::OneByte, 0}; });
    add([](Step &s) { s = {s.op, s.at, s.removed, s.count, Letters::OneByte, 0}; });
    add([](Step &s) { s = {s.op, s.at, s.removed, s.count, s.letters, 0}; });
    add([](Step &s) { s = {s.op, 0, 0, s.count, s.letters, s.refused}; });
    return forms;
}

std::vector<Step> shortest(const std::vector<Step> &steps)
{
    const auto shows = [](const std::vector<Step> &some) { return violationOf(some).has_value(); };
    return simplified(shortened(steps, shows), shows, simplerSteps);
}

std::string reportOf(const std::vector<Step> &steps)
{
    std::string rows;
    for (const Step &step : steps) {
        rows += rowOf(step);
    }
    const auto violation = violationOf(steps);
    return rows + "// " + (violation ? violation->what : std::string("nothing is wrong")) + '\n';
}

std::vector<Step> RandomSteps::make(std::size_t count)
{
    std::vector<Step> steps;
    // Some sequences never ask for UTF-16, some never run out of memory.
    const bool isNarrow = below(2) == 0;
    const bool refuses = below(2) == 0;
    while (steps.size() < count) {
        Step step = {op(), place(), below(3) == 0 ? length() : below(20), length(), Letters::OneByte, 0};
        if (isNarrow && (step.op == Op::Widen || step.op == Op::ReplaceByOwn || step.op == Op::SetOwn)) {
            continue;
        }
        step.letters = !isNarrow && below(8) == 0 ? Letters::TwoBytes : Letters::OneByte;
        step.refused = refuses && below(4) == 0 ? static_cast<int>(below(7)) - 3 : 0;
        steps.push_back(step);
    }
    return steps;
}

Op RandomSteps::op()
{
    // What edits and what grows comes often; what empties the text, seldom.
    static constexpr Op often[] = {Op::Write, Op::WriteOneByte, Op::LineEnd, Op::Replace, Op::Replace, Op::Replace};
    return below(2) == 0 ? often[below(std::size(often))] : static_cast<Op>(below(opCount));
}

qint64 RandomSteps::length()
{
    switch (below(8)) {
    case 0: return std::max<qint64>(0, block * below(4) + below(7) - 3);
    case 1: return below(3 * block);
    case 2: return 0;
    default: return below(40);
    }
}

qint64 RandomSteps::place()
{
    switch (below(5)) {
    case 0: return below(10);
    case 1: return -1 - below(10);
    case 2: return std::max<qint64>(0, block * below(5) + below(7) - 3);
    default: return below(8 * block);
    }
}

std::vector<Step> stepsOf(const std::uint8_t *data, std::size_t size)
{
    constexpr std::size_t stepSize = 8;
    constexpr std::size_t mostSteps = 400;
    std::vector<Step> steps;
    for (; size >= stepSize && steps.size() < mostSteps; data += stepSize, size -= stepSize) {
        const auto number = [data](std::size_t i) { return qint64(data[i]) | qint64(data[i + 1]) << 8; };
        // A length is short, or so many blocks and a little more or less.
        const auto length = [](qint64 code) {
            return code < 0x8000 ? code % 100 : std::max<qint64>(0, (code >> 8) % 4 * 32000 + (code & 0xFF) - 128);
        };
        steps.push_back({static_cast<Op>(data[0] % opCount), number(2) * ((data[1] & 1) != 0 ? -1 : 2),
                         length(number(4)), length(number(6)),
                         (data[1] & 2) != 0 ? Letters::TwoBytes : Letters::OneByte,
                         (data[1] & 4) != 0 ? (data[1] >> 3) % 7 - 3 : 0});
    }
    return steps;
}

} // namespace textstore

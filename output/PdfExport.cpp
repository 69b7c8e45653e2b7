#include "PdfExport.h"

#include "LineBreaker.h"
#include "PdfDocument.h"
#include "PdfText.h"
#include "PdfTypesetter.h"
#include "Xlate.h"

#include <QHash>

#include <algorithm>
#include <deque>
#include <numeric>

namespace kareport
{

namespace
{

/// Lines closer than this, in points, are no lines any more.
constexpr float smallestLeading = 0.05F;

/// Missing characters that are named; the others are counted.
constexpr std::size_t mostWarnings = 20;

/// Writes one text as a PDF.
template <typename Text>
class PdfExport
{
public:
    PdfExport(Text text, const PdfOptions &options, PdfNotes &notes) : text_(text), options_(options), notes_(notes) {}

    bool write(QIODevice &device)
    {
        const PdfPageSetup &setup = options_.page;
        if (setup.resolution == 0 || setup.linesPerPage < 1) {
            return fail(Xlate("the page has not been measured"));
        }
        if (setup.fontSize == 0) {
            return fail(Xlate("a font size of 1 point or more was expected"));
        }
        box_ = pdfPageBox(setup);
        if (box_.right <= box_.left || box_.top <= box_.bottom) {
            return fail(Xlate("the margins leave no room on the page: smaller margins were expected"));
        }
        if (!loadFaces()) {
            return false;
        }
        const qint64 pages = std::max<qint64>(0, (options_.lineCount - 1 + setup.linesPerPage) / setup.linesPerPage);
        const qint64 lines = linesOfText();
        linesToFit_ = linesToFit(setup, box_, typesetter_.height(), lines);
        pages_ = std::max(pages, pagesOfText());
        if (!pdf_.expectPages(pages_) || !addPages()) {
            return fail(libraryError());
        }
        // A device that fails says why itself.
        return pdf_.save(device) || (pdf_.isGood() ? false : fail(libraryError()));
    }

private:
    bool fail(const QString &problem)
    {
        if (notes_.problem.isEmpty()) {
            notes_.problem = problem;
        }
        return false;
    }

    QString libraryError() const
    {
        return Xlate("the PDF library failed with error %1")
            .arg(QStringLiteral("0x%1").arg(QString::number(pdf_.error(), 16).toUpper()));
    }

    bool loadFaces()
    {
        const std::vector<CharacterCount> characters = visibleCharacters(text_);
        const auto preferred = preferredPdfFace(options_.fontFolders.value_or(systemFontFolders()));
        const std::vector<PdfFace> faces = choosePdfFaces(preferred, fixedPitchPdfFaces(), characters);
        if (faces.empty()) {
            return fail(Xlate("no fixed-pitch font was found: DejaVu Sans Mono, Liberation Mono or Hack was expected"));
        }
        if (!typesetter_.loadFaces(pdf_, faces)) {
            return fail(Xlate("the font file \"%1\" cannot be used").arg(typesetter_.failedFace()));
        }
        for (const CharacterCount &entry : characters) {
            if (!typesetter_.covers(entry.character)) {
                uncovered_.push_back(entry.character);
            } else {
                widest_ = std::max(widest_, typesetter_.width(entry.character));
            }
        }
        substitute_ =
            typesetter_.covers(QChar::ReplacementCharacter) ? QChar(QChar::ReplacementCharacter) : QChar(u'?');
        widest_ = std::max(widest_, typesetter_.width(substitute_.unicode()));
        return true;
    }

    qint64 linesOfText() const { return std::count(text_.begin(), text_.end(), typename Text::value_type('\n')) + 1; }

    /// An edited text may have more lines than were counted when it was written; they get their pages, too.
    qint64 pagesOfText() const
    {
        const qint64 feeds = linesOfText() - 1;
        const bool lineIsOpen = !text_.isEmpty() && text_.back() != QChar(u'\n');
        return (feeds + (lineIsOpen ? 1 : 0) + options_.page.linesPerPage - 1) / options_.page.linesPerPage;
    }

    bool addPages()
    {
        qsizetype begin = 0;
        for (qint64 page = 0; page < pages_; ++page) {
            const qsizetype end = pageEnd(text_, begin, options_.page.linesPerPage);
            if (!addPage(begin, end)) {
                return false;
            }
            begin = end;
            if (options_.progress && !options_.progress(page + 1, pages_)) {
                return fail(Xlate("stopped"));
            }
        }
        return true;
    }

    bool addPage(qsizetype begin, qsizetype end)
    {
        const double width = (double(box_.right) - double(box_.left)) * 1000 / options_.page.fontSize;
        pieces_.clear();
        const qint64 firstLine = lineNumber_;
        std::size_t line = 0;
        for (qsizetype at = begin; at < end; ++line) {
            const qsizetype feed = text_.indexOf(u'\n', at);
            const qsizetype lineEnd = feed < 0 || feed >= end ? end : feed;
            if (line == lines_.size()) {
                lines_.emplace_back();
            }
            QString &visible = lines_[line];
            visibleLine(text_.sliced(at, lineEnd - at), visible);
            ++lineNumber_;
            replaceUncovered(visible);
            if (double(visible.size()) * widest_ <= width) {
                pieces_.push_back(visible);
            } else {
                breakLine(
                    visible, width, [this](char32_t c) { return typesetter_.width(c); }, pieces_);
            }
            at = lineEnd + 1;
        }
        const LinePlacement placement =
            placeLines(options_.page, box_, typesetter_.height(), linesToFit_, qsizetype(pieces_.size()));
        if (placement.leading < smallestLeading) {
            return fail(
                Xlate("the lines %1 to %2 of the report become %3 when they are broken: they do not fit one page")
                    .arg(QString::number(firstLine + 1), QString::number(lineNumber_),
                         QString::number(pieces_.size())));
        }
        return typesetter_.addPage(pdf_, box_, placement, pieces_);
    }

    void replaceUncovered(QString &line)
    {
        if (uncovered_.empty()) {
            return;
        }
        QString shown;
        for (const char32_t character : line.toUcs4()) {
            if (!std::binary_search(uncovered_.begin(), uncovered_.end(), character)) {
                shown += QChar::fromUcs4(character);
                continue;
            }
            if (QChar::category(character) == QChar::Other_Format) {
                continue; // a mark that is not seen where it is known either
            }
            shown += substitute_;
            const auto known = missingAt_.constFind(character);
            if (known != missingAt_.constEnd()) {
                ++notes_.missing[*known].count;
            } else {
                missingAt_.insert(character, notes_.missing.size());
                notes_.missing.push_back({character, 1, lineNumber_});
            }
        }
        line = shown;
    }

    Text text_;
    const PdfOptions &options_;
    PdfNotes &notes_;
    PdfDocument pdf_;
    PdfTypesetter typesetter_;
    PdfPageBox box_;
    qsizetype linesToFit_ = 1; ///< on a page
    qint64 pages_ = 0;
    int widest_ = 0;
    std::vector<char32_t> uncovered_; ///< in order
    QChar substitute_;
    QHash<char32_t, std::size_t> missingAt_; ///< place among the notes
    qint64 lineNumber_ = 0;
    std::deque<QString> lines_; ///< of the page at hand, used again for every page
    std::vector<QStringView> pieces_;
};

template <typename Text>
bool writeText(QIODevice &device, Text text, const PdfOptions &options, PdfNotes *notes)
{
    PdfNotes own;
    return PdfExport<Text>(text, options, notes != nullptr ? *notes : own).write(device);
}

} // namespace

QStringList PdfNotes::warnings() const
{
    QStringList texts;
    for (std::size_t i = 0; i < std::min(missing.size(), mostWarnings); ++i) {
        const MissingCharacter &entry = missing[i];
        const QString code = QString::number(entry.character, 16).toUpper().rightJustified(4, u'0');
        texts += Xlate("no font has the character \"%1\" (U+%2), first in line %3, %4 times in all")
                     .arg(QString::fromUcs4(&entry.character, 1), code, QString::number(entry.firstLine),
                          QString::number(entry.count));
    }
    if (missing.size() > mostWarnings) {
        const qint64 others =
            std::accumulate(missing.begin() + mostWarnings, missing.end(), qint64(0),
                            [](qint64 sum, const MissingCharacter &entry) { return sum + entry.count; });
        texts += Xlate("no font has %1 other characters, %2 times in all")
                     .arg(QString::number(missing.size() - mostWarnings), QString::number(others));
    }
    return texts;
}

bool writePdf(QIODevice &device, QStringView text, const PdfOptions &options, PdfNotes *notes)
{
    return writeText(device, text, options, notes);
}

bool writePdf(QIODevice &device, QLatin1StringView text, const PdfOptions &options, PdfNotes *notes)
{
    return writeText(device, text, options, notes);
}

} // namespace kareport

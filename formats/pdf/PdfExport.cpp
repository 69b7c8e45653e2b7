#include "PdfExport.h"

#include "CharacterCells.h"
#include "FixedPitchFont.h"
#include "LineBreaker.h"
#include "MemoryLasts.h"
#include "PageHeader.h"
#include "PdfDocument.h"
#include "PdfNavigation.h"
#include "PdfText.h"
#include "PdfTypesetter.h"
#include "ReportPages.h"
#include "StandardText.h"
#include "Xlate.h"

#include <algorithm>
#include <deque>
#include <numeric>
#include <span>
#include <string>
#include <unordered_map>

namespace kareport
{

namespace
{

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
        const std::u32string characters = visibleCharacters(text_);
        if (!loadFaces(characters)) {
            return false;
        }
        const std::vector<ReportPage> pages = reportPages(text_, options_.pageStarts, setup.linesPerPage);
        const qint64 lines = std::accumulate(pages.begin(), pages.end(), qint64(0),
                                             [](qint64 sum, const ReportPage &page) { return sum + page.lines; });
        chooseTypeSize(characters, lines);
        // A sheet of a page's continuation holds a line, or a cell of a broken one, at least.
        const qint64 sheets =
            static_cast<qint64>(pages.size()) + lines + (notes_.broken.count > 0 ? 8 * text_.size() : 0);
        if (!pdf_.expectPages(sheets) || !addPages(pages) || !addDetails() || !typesetter_.finish()) {
            return fail(libraryError());
        }
        // A device that fails reports the reason itself.
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
        const QString face = typesetter_.failedFace();
        return face.isEmpty() ? Xlate("the PDF library failed with error %1")
                                    .arg(QStringLiteral("0x%1").arg(QString::number(pdf_.error(), 16).toUpper()))
                              : Xlate("the font file \"%1\" cannot be used").arg(face);
    }

    bool loadFaces(const std::u32string &characters)
    {
        const auto preferred = preferredPdfFace(options_.fontFolders.value_or(systemFontFolders()));
        const std::vector<PdfFace> faces = orderPdfFaces(preferred, fixedPitchPdfFaces());
        if (faces.empty()) {
            return fail(Xlate("no fixed-pitch font was found: one of %1 was expected")
                            .arg(substituteFaces().join(QStringLiteral(", "))));
        }
        return typesetter_.begin(faces, characters) || fail(libraryError());
    }

    void chooseTypeSize(const std::u32string &characters, qint64 lines)
    {
        const PdfPageSetup &setup = options_.page;
        const FaceHeight height = typesetter_.height();
        linesToFit_ = linesToFit(setup, box_, height, lines);
        fontSize_ = setup.fontSize;
        const double size = placeLines(fontSize_, box_, height, linesToFit_, linesToFit_).fontSize;
        cellsAcross_ = cellsAcross(box_, typesetter_.cell(), size);
        const WideLines wide = wideLines(text_, characters, cellsAcross_);
        if (wide.count == 0) {
            return;
        }
        fontSize_ = sizeForCells(box_, typesetter_.cell(), size, wide.widest);
        if (fontSize_ < size) {
            notes_.reduced = {wide.count, wide.first, fontSize_};
        }
        cellsAcross_ = cellsAcross(box_, typesetter_.cell(), fontSize_);
        const WideLines broken = wideLines(text_, characters, cellsAcross_);
        if (broken.count > 0) {
            notes_.broken = {broken.count, broken.first, fontSize_};
        }
    }

    bool addPages(const std::vector<ReportPage> &pages)
    {
        qsizetype at = 0;
        qint64 done = 0;
        for (const ReportPage &page : pages) {
            const auto begin = static_cast<qsizetype>(page.begin);
            lineNumber_ += text_.sliced(at, begin - at).count(u'\n'); // lines that are on no page
            at = static_cast<qsizetype>(page.end);
            if (!addPage(begin, at)) {
                return false;
            }
            if (options_.progress && !options_.progress(++done, static_cast<qint64>(pages.size()))) {
                return fail(Xlate("stopped"));
            }
        }
        return true;
    }

    bool addPage(qsizetype begin, qsizetype end)
    {
        pieces_.clear();
        std::size_t line = 0;
        for (qsizetype at = begin; at < end; ++line) {
            const qsizetype feed = text_.indexOf(u'\n', at);
            const qsizetype lineEnd = feed < 0 || feed >= end ? end : feed;
            if (line == lines_.size()) {
                lines_.emplace_back();
            }
            QString &visible = lines_[line];
            visibleLine(text_.sliced(at, lineEnd - at), visible);
            places_.addLine(lineEnd, pieces_.size());
            ++lineNumber_;
            if (!typesetter_.coversAll()) {
                typesetter_.prepare(visible, [this](char32_t character) { noteMissing(character); });
            }
            if (notes_.broken.count > 0) {
                breakLine(
                    visible, static_cast<double>(cellsAcross_), [](char32_t c) { return cellsOf(c); }, pieces_);
            } else {
                pieces_.push_back(visible);
            }
            at = lineEnd + 1;
        }
        if (!addSheets()) {
            return false;
        }
        if (options_.details != nullptr) {
            const auto number = lines_.empty() || line == 0 ? std::nullopt : pageNumberOf(lines_.front());
            pageNumber_ = number ? *number : pageNumber_ + 1;
            labels_.addPage(static_cast<unsigned>(pageNumber_), sheetsOfPage_);
        }
        return true;
    }

    bool addDetails()
    {
        const PdfDetails *details = options_.details;
        return details == nullptr ||
               (pdf_.describe(*details) && (!details->hasOutline || writeOutline(pdf_, places_.places())) &&
                (!details->hasPageLabels || writePageLabels(pdf_, labels_.labels())));
    }

    bool addSheets()
    {
        sheetsOfPage_ = 0;
        const LinePlacement placement =
            placeLines(fontSize_, box_, typesetter_.height(), linesToFit_, static_cast<qsizetype>(pieces_.size()));
        std::span<const QStringView> left(pieces_);
        do {
            const auto taken = left.first(std::min(left.size(), static_cast<std::size_t>(placement.lines)));
            if (!typesetter_.addPage(box_, placement, taken)) {
                return false;
            }
            ++sheetsOfPage_;
            places_.addSheet(pdf_.lastPage(), box_, placement, pieces_.size() - left.size(), taken.size());
            left = left.subspan(taken.size());
        } while (!left.empty());
        return true;
    }

    void noteMissing(char32_t character)
    {
        const auto [known, isNew] = missingAt_.try_emplace(character, notes_.missing.size());
        if (!isNew) {
            ++notes_.missing[known->second].count;
        } else {
            notes_.missing.push_back({character, 1, lineNumber_});
        }
    }

    Text text_;
    const PdfOptions &options_;
    PdfNotes &notes_;
    PdfDocument pdf_;
    PdfTypesetter typesetter_{pdf_};
    PdfPageBox box_;
    double fontSize_ = 0;
    qsizetype linesToFit_ = 1; ///< on a page
    qint64 cellsAcross_ = 0;
    std::unordered_map<char32_t, std::size_t> missingAt_; ///< place among the notes
    qint64 lineNumber_ = 0;
    std::deque<QString> lines_; ///< of the current page, reused for every page
    std::vector<QStringView> pieces_;
    PdfPlaces places_{options_.outline};
    PdfPageLabels labels_;
    unsigned sheetsOfPage_ = 0;
    int pageNumber_ = 0; ///< of the current page
};

template <typename Text>
bool writeText(QIODevice &device, Text text, const PdfOptions &options, PdfNotes *notes)
{
    PdfNotes own;
    PdfNotes &said = notes != nullptr ? *notes : own;
    bool isWritten = false;
    if (!doneWhileMemoryLasts([&] { isWritten = PdfExport<Text>(text, options, said).write(device); })) {
        said.problem = noMemoryText();
    }
    return isWritten;
}

} // namespace

bool writePdf(QIODevice &device, QStringView text, const PdfOptions &options, PdfNotes *notes)
{
    return writeText(device, text, options, notes);
}

bool writePdf(QIODevice &device, QLatin1StringView text, const PdfOptions &options, PdfNotes *notes)
{
    return writeText(device, text, options, notes);
}

} // namespace kareport

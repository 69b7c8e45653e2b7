#include "PageRows.h"

#include "Characters.h"

#include <QFontMetricsF>
#include <QGlyphRun>
#include <QPaintEngine>
#include <QPainter>
#include <QRawFont>
#include <QTextBlock>
#include <QTextDocument>

#include <algorithm>

namespace kareport
{

PageRows::PageRows(const QTextDocument &text, PrintFaces &faces, QPaintDevice &device, const PageArea &area,
                   QPainter *painter, std::vector<PageRow> *places)
    : text_(text), faces_(faces), device_(device), area_(area), painter_(painter), noted_(places)
{
    if (painter_ != nullptr) {
        painter_->save();
        // A picture, which a preview is made of, keeps texts only.
        drawsGlyphs_ = painter_->paintEngine()->type() != QPaintEngine::Picture;
    }
}

PageRows::~PageRows()
{
    if (painter_ != nullptr) {
        painter_->restore();
    }
}

int PageRows::addLine(const QTextBlock &block, int from, int stop)
{
    line_ = block.text();
    lineStart_ = block.position();
    readRuns(block, from, stop);
    const qreal width = plainWidth();
    if (width < 0 || width > area_.width) {
        return addWrapped(from, stop);
    }
    const Extents line = extents(from, stop);
    if (!reserve(line.height)) {
        return from;
    }
    if (painter_ != nullptr) {
        drawRuns(area_.top + y_ + line.ascent);
    }
    if (noted_ != nullptr) {
        notePlace(from, stop, line.height);
    }
    y_ += line.height;
    return stop;
}

void PageRows::readRuns(const QTextBlock &block, int from, int stop)
{
    runs_.clear();
    for (auto it = block.begin(); !it.atEnd(); ++it) {
        const QTextFragment fragment = it.fragment();
        const int first = std::max(from, fragment.position() - block.position());
        const int last = std::min(stop, fragment.position() - block.position() + fragment.length());
        if (first < last) {
            runs_.push_back({first, last - first, &faces_.face(fragment.charFormat(), fragment.charFormatIndex())});
        }
    }
    if (runs_.empty()) {
        const PrintFace &face =
            block.length() > 1 ? faces_.base() : faces_.face(block.charFormat(), block.charFormatIndex());
        runs_.push_back({from, stop - from, &face});
    }
}

qreal PageRows::plainWidth() const
{
    qreal width = 0;
    for (const Run &run : runs_) {
        const QStringView text = QStringView(line_).mid(run.from, run.length);
        if (hasGlyphs(*run.face, text)) {
            width += qreal(run.face->pitch) * run.length; // what has a glyph of its own is plain
            continue;
        }
        if (!std::all_of(text.begin(), text.end(), [](QChar character) { return needsNoShaping(character.unicode()); }))
        {
            return -1;
        }
        width += widthOf(run);
    }
    return width;
}

bool PageRows::reserve(int height)
{
    full_ = y_ > 0 && y_ + height > area_.height;
    return !full_;
}

PageRows::Extents PageRows::extents(int from, int stop) const
{
    int ascent = 0;
    int descent = 0;
    for (const Run &run : runs_) {
        if (run.length == 0 || (run.from < stop && run.from + run.length > from)) {
            ascent = std::max(ascent, run.face->ascent);
            descent = std::max(descent, run.face->height - run.face->ascent);
        }
    }
    return {ascent, ascent + descent};
}

bool PageRows::hasGlyphs(const PrintFace &face, QStringView text)
{
    return face.pitch > 0 && std::all_of(text.begin(), text.end(), [&face](QChar character) {
               return character.unicode() < face.glyphs.size() && face.glyphs.at(character.unicode()) != 0;
           });
}

qreal PageRows::widthOf(const Run &run) const
{
    const QStringView text = QStringView(line_).mid(run.from, run.length);
    return hasGlyphs(*run.face, text) ? qreal(run.face->pitch) * run.length
                                      : QFontMetricsF(run.face->font, &device_).horizontalAdvance(text.toString());
}

void PageRows::use(const PrintFace &face)
{
    if (used_ != &face) {
        painter_->setFont(face.font);
        painter_->setPen(face.color);
        used_ = &face;
    }
}

void PageRows::drawRuns(qreal baseline)
{
    qreal x = area_.left;
    for (const Run &run : runs_) {
        const QStringView text = QStringView(line_).mid(run.from, run.length);
        use(*run.face);
        if (drawsGlyphs_ && hasGlyphs(*run.face, text)) {
            drawGlyphs(run, x, baseline);
        } else if (!text.isEmpty()) {
            painter_->drawText(QPointF(x, baseline), text.toString());
        }
        x += widthOf(run);
    }
}

void PageRows::drawGlyphs(const Run &run, qreal x, qreal baseline)
{
    // One blank of several is enough to tell words apart when the text is read back, and blanks cost what letters cost.
    const bool keepsBlanks = run.face->font.underline();
    glyphs_.clear();
    places_.clear();
    for (int i = 0; i < run.length; ++i) {
        const char16_t character = line_[run.from + i].unicode();
        if (character != u' ' || keepsBlanks || (i > 0 && line_[run.from + i - 1] != u' ')) {
            glyphs_.push_back(run.face->glyphs.at(character));
            places_.emplace_back(qreal(i) * run.face->pitch, 0);
        }
    }
    if (!glyphs_.empty()) {
        QGlyphRun glyphs;
        glyphs.setRawFont(run.face->raw);
        glyphs.setUnderline(run.face->font.underline());
        glyphs.setRawData(glyphs_.data(), places_.data(), static_cast<int>(glyphs_.size()));
        painter_->drawGlyphRun(QPointF(x, baseline), glyphs);
    }
}

void PageRows::addEdges(std::vector<qreal> &edges, int from, int stop) const
{
    qreal x = area_.left;
    for (const Run &run : runs_) {
        const QStringView text = QStringView(line_).mid(run.from, run.length);
        const bool isEven = hasGlyphs(*run.face, text);
        const QFontMetricsF metrics(run.face->font, &device_);
        for (int i = 0; i < run.length; ++i) {
            const int at = run.from + i;
            if (at >= from && at < stop) {
                edges.push_back(
                    x + (isEven ? qreal(i) * run.face->pitch : metrics.horizontalAdvance(text.first(i).toString())));
            }
        }
        x += widthOf(run);
    }
    edges.push_back(x);
}

void PageRows::notePlace(int from, int stop, int height)
{
    PageRow row;
    row.start = qint64(lineStart_) + from;
    row.stop = qint64(lineStart_) + stop;
    row.top = area_.top + y_;
    row.height = height;
    addEdges(row.edges, from, stop);
    noted_->push_back(std::move(row));
}

PageRows::LineSize PageRows::measureLine(const QTextBlock &block)
{
    line_ = block.text();
    auto stop = static_cast<int>(line_.size());
    readRuns(block, 0, stop);
    const auto rows = static_cast<int>(line_.count(QChar::LineSeparator)) + 1;
    const int height = extents(0, stop).height * rows;
    // Blanks at a line's end may extend into the margin.
    while (stop > 0 && line_[stop - 1] == u' ') {
        --stop;
    }
    if (stop < line_.size()) {
        line_.truncate(stop);
        readRuns(block, 0, stop);
    }
    const qreal width = plainWidth();
    return {width < 0 ? wholeWidth() : width, height};
}

} // namespace kareport

#pragma once

#include "PageRow.h"
#include "PrintFaces.h"

#include <QString>

#include <vector>

class QPaintDevice;
class QPainter;
class QTextBlock;
class QTextDocument;
class QTextLayout;

namespace kareport
{

/// The part of a page that takes text, in dots.
struct PageArea
{
    qreal left = 0;
    qreal top = 0;
    qreal width = 0;
    qreal height = 0;
};

/// The rows of one page, from its top down.
class PageRows
{
public:
    /// @param painter  draws the rows where it is not null
    /// @param places   receives where each row is; may be null
    PageRows(const QTextDocument &text, PrintFaces &faces, QPaintDevice &device, const PageArea &area,
             QPainter *painter, std::vector<PageRow> *places = nullptr);
    ~PageRows();
    PageRows(const PageRows &) = delete;
    PageRows &operator=(const PageRows &) = delete;

    /// Adds the characters `from` to `stop` of a line. @return the first that did not fit; `stop` with `isFull` false when
    /// all did
    int addLine(const QTextBlock &block, int from, int stop);
    /// The size of a line that nothing breaks.
    struct LineSize
    {
        qreal width;
        int height;
    };
    LineSize measureLine(const QTextBlock &block);
    /// Whether the last row did not fit.
    bool isFull() const { return full_; }

private:
    /// Neighbouring characters of one face.
    struct Run
    {
        int from;
        int length;
        const PrintFace *face;
    };

    void readRuns(const QTextBlock &block, int from, int stop);
    /// The width of a line that can be drawn without laying it out; below 0 for one that cannot.
    qreal plainWidth() const;
    /// The width of any line.
    qreal wholeWidth() const;
    int endOfPiece(int from, int stop) const;
    bool reserve(int height);
    /// What the characters from `from` to before `stop` take above their baseline and in all.
    struct Extents
    {
        int ascent;
        int height;
    };
    Extents extents(int from, int stop) const;
    static bool hasGlyphs(const PrintFace &face, QStringView text);
    qreal widthOf(const Run &run) const;
    void notePlace(int from, int stop, int height);
    void addEdges(std::vector<qreal> &edges, int from, int stop) const;
    void drawRuns(qreal baseline);
    void drawGlyphs(const Run &run, qreal x, qreal baseline);
    void use(const PrintFace &face);
    int addWrapped(int from, int stop);
    void prepare(QTextLayout &layout, int from, int stop) const;

    const QTextDocument &text_;
    PrintFaces &faces_;
    QPaintDevice &device_;
    const PageArea area_;
    QPainter *painter_;
    std::vector<PageRow> *noted_;
    bool drawsGlyphs_ = false;
    const PrintFace *used_ = nullptr;
    QString line_;
    int lineStart_ = 0; ///< of the line, in the text
    std::vector<Run> runs_;
    std::vector<quint32> glyphs_;
    std::vector<QPointF> places_;
    qreal y_ = 0;
    bool full_ = false;
};

} // namespace kareport

#include "LandXmlReferences.h"
#include "LandXmlRows.h"
#include "Xlate.h"

#include <algorithm>

// What lists of alignments have in common.

namespace kareport
{

namespace
{

/// Notes that the first of several lines of an alignment is taken. @param several  says so where none is asked for by its name
template <typename Line>
void noteOthers(const std::vector<Line> &lines, const QString &wanted, const QString &several, const QString &repeated,
                LandXmlNotes &notes)
{
    const std::string name = wanted.toStdString();
    const Line *first = nullptr;
    for (const Line &line : lines) {
        if (!name.empty() && line.name != name) {
            continue;
        }
        if (first != nullptr) {
            const QString text = name.empty() ? several.arg(QString::number(lines.size()),
                                                            QString::fromStdString(first->name.substr(0, 100)))
                                              : repeated.arg(wanted);
            notes.add(line.byte, text);
            return;
        }
        first = &line;
    }
}

} // namespace

bool LandXmlRows::readAlignments(AlignmentModel &model, LandXmlWants wants)
{
    const LandXmlQuery &query = source_.query;
    wants.alignments = true;
    wants.alignment = (query.kind == LandXmlListKind::OffsetsOf ? query.alignment : query.name).toStdString();
    const auto reader = readAll(wants);
    if (!reader) {
        return false;
    }
    model.alignments = std::move(reader->alignments);
    model.widths.fill(reader->gradeSurfaces, model.alignments, modelNotes_);
    return true;
}

bool LandXmlRows::makeRoutes(AlignmentModel &model, const std::vector<LandXmlAlignment *> &alignments)
{
    const bool refers = std::any_of(alignments.begin(), alignments.end(), [](const LandXmlAlignment *alignment) {
        return hasReferences(alignment->elements);
    });
    const LandXmlPointTable *points = refers ? pointTable() : nullptr;
    if (refers && points == nullptr) {
        return false;
    }
    for (LandXmlAlignment *alignment : alignments) {
        if (points != nullptr) {
            resolve(alignment->elements, *points, modelNotes_);
        }
    }
    LandXmlComparison comparison(source_.header.units, source_.query.tolerance, modelNotes_);
    model.routes = routesOf({alignments.begin(), alignments.end()}, comparison, modelNotes_);
    for (const LandXmlRoute &route : model.routes) {
        if (route.stationFault) {
            fail(*route.stationFault);
            return false;
        }
    }
    return true;
}

bool LandXmlRows::readNamedAlignments(AlignmentModel &model, const LandXmlWants &wants)
{
    if (!readAlignments(model, wants)) {
        return false;
    }
    std::vector<LandXmlAlignment *> named;
    for (LandXmlAlignment &alignment : model.alignments) {
        if (isNamed(alignment.name)) {
            named.push_back(&alignment);
        }
    }
    return makeRoutes(model, named);
}

void LandXmlRows::noteOtherGradeLines(const LandXmlAlignment &alignment)
{
    noteOthers(alignment.gradeLines, source_.query.gradeLine,
               Xlate("the alignment has %1 grade lines: the first one, \"%2\", was taken, as the job names none"),
               Xlate("several grade lines of the alignment have the name \"%1\": the first one was taken"),
               modelNotes_);
}

void LandXmlRows::noteOtherSurfaces(const LandXmlAlignment &alignment)
{
    noteOthers(alignment.surfaceLines, source_.query.surface,
               Xlate("the alignment has %1 surfaces: the first one, \"%2\", was taken, as the job names none"),
               Xlate("several surfaces of the alignment have the name \"%1\": the first one was taken"), modelNotes_);
}

} // namespace kareport

#pragma once

#include "LandXmlNames.h"
#include "LandXmlNotes.h"
#include "LandXmlPointTable.h"
#include "LandXmlQuery.h"
#include "LandXmlReader.h"
#include "LandXmlRoute.h"
#include "LandXmlUnits.h"
#include "LandXmlValue.h"
#include "LandXmlWidths.h"
#include "RowList.h"

#include <QString>
#include <QStringList>

#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace kareport
{

/// What rows are made from.
struct LandXmlSource
{
    std::shared_ptr<const FileBytes> file;
    LandXmlHeader header;
    LandXmlQuery query; ///< its lengths are in metres
    /// Is told how many bytes have been read while more than a batch of rows is read at once. @return false to stop
    ReadProgress progress;
    double unit = 1; ///< metres in the unit of lengths that the query was asked in, for messages
};

/// The alignments of a file, and the geometry of those that are asked for.
struct AlignmentModel
{
    std::vector<LandXmlAlignment> alignments;
    LandXmlWidthTable widths; ///< where they are wanted
    std::vector<LandXmlRoute> routes;
};

/// Rows of a file, made one at a time.
class LandXmlRows
{
public:
    explicit LandXmlRows(LandXmlSource source);
    virtual ~LandXmlRows() = default;
    LandXmlRows(const LandXmlRows &) = delete;
    LandXmlRows &operator=(const LandXmlRows &) = delete;

    static std::unique_ptr<LandXmlRows> make(LandXmlSource source);

    virtual std::vector<LandXmlVariable> variables() const = 0;
    /// Says which variables are asked for; all where it is not called. What concerns others alone is not noted.
    void setAsked(const QStringList &variables) { asked_ = variables; }
    /// Goes on to the next row. @return false after the last one, and when something is wrong
    virtual bool next() = 0;
    /// Goes back before the first row.
    virtual void rewind() = 0;
    /// Keeps all rows that are gone through from now on, for `goTo`.
    virtual void keep() {}
    /// Goes to a row by its number from 0, after all were gone through.
    virtual void goTo(std::size_t index) = 0;

    /// A value of the current row, valid until the next one.
    virtual LandXmlValue value(std::size_t variable) const = 0;
    /// Where the current row comes from.
    virtual std::size_t byte() const = 0;
    /// The same of a row by its number from 0, after all were gone through; nothing where there is no such row.
    virtual std::optional<std::size_t> byteOf(std::size_t index) = 0;
    /// Bytes of the file that were read.
    std::size_t position() const { return position_; }
    const std::optional<InputError> &error() const { return error_; }
    /// Whether the progress has stopped the reading.
    bool isStopped() const { return isStopped_; }
    /// What there is to say of the file, complete after the last row.
    std::vector<InputError> notes() const;

protected:
    void fail(std::size_t byte, const QString &text);
    void fail(const LandXmlFault &fault) { fail(fault.byte, fault.text); }
    /// The points of the file by their names, read at the first call; null when that fails.
    const LandXmlPointTable *pointTable();
    /// Reads the whole file. @return what was read, or null when something is wrong or the progress has stopped it
    std::unique_ptr<LandXmlReader> readAll(const LandXmlWants &wants);
    /// Reads the alignments, without their geometry. @return whether that went well
    bool readAlignments(AlignmentModel &model, LandXmlWants wants);
    /// Makes the geometry of alignments of the model: what is wrong with others does not count. @return whether that went well
    bool makeRoutes(AlignmentModel &model, const std::vector<LandXmlAlignment *> &alignments);
    /// Reads the alignments, and makes the geometry of those that the query asks for. @return whether that went well
    bool readNamedAlignments(AlignmentModel &model, const LandXmlWants &wants = {});
    /// Whether the query asks for something of a name, or for all.
    bool isNamed(const std::string &name) { return names_.matches(name); }
    /// Fails where a name that the query asks for has not been met. @return whether all were
    bool expectNames();
    /// Whether a variable is asked for.
    bool isAsked(const char *variable) const
    {
        return !asked_ || asked_->contains(QLatin1StringView(variable), Qt::CaseInsensitive);
    }
    /// Notes lines of an alignment of which the first is taken, where the query names none or several have the name: heights are
    /// those of one line.
    void noteOtherGradeLines(const LandXmlAlignment &alignment);
    void noteOtherSurfaces(const LandXmlAlignment &alignment);

    LandXmlSource source_;
    LandXmlNames names_;      ///< of groups, surfaces, parcels or alignments
    LandXmlNames gradeLines_; ///< of grade lines
    LandXmlNames surfaces_;   ///< of surfaces along and across alignments
    LandXmlNotes modelNotes_; ///< of what is read once
    LandXmlNotes passNotes_;  ///< of the current pass, where rows are made while the file is read
    std::size_t position_ = 0;
    std::optional<InputError> error_;
    bool isStopped_ = false;

private:
    std::optional<QStringList> asked_;
    std::unique_ptr<LandXmlPointTable> pointTable_;
};

} // namespace kareport

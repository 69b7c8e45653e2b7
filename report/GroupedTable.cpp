#include "GroupedTable.h"

#include "TextFolding.h"

#include <algorithm>

namespace kareport
{

namespace
{

/// The formatter that shows the totals of a variable in a field.
TotalFormatter totalFormatter(const sXmlReportField &field, const FormatOptions &options, const TableGroups &groups,
                              std::optional<std::size_t> variable)
{
    const bool isConverted = !variable || groups.addsPrinted;
    return {field, options, isConverted ? UnitRatio() : groups.variables[*variable].ratio};
}

} // namespace

GroupedTable::GroupedTable(PageWriter &page, const FormatOptions &options, const UXmlReportTable &table,
                           GroupedList &groups, DataRemarks &remarks)
    : page_(page),
      options_(options),
      textOptions_{options.settings, u'\t', false, false},
      list_(groups),
      groups_(groups.groups()),
      remarks_(remarks),
      lines_(page),
      open_(groups_.levels.size()),
      totals_(groups_.levels.size() + 1),
      leftOut_(groups_.variables.size()),
      pageTotals_(groups_.variables.size())
{
    for (Totals &totals : totals_) {
        totals.resize(groups_.variables.size());
    }
    for (std::size_t i = 0; i < groups_.variables.size(); ++i) {
        const TotalledVariable &variable = groups_.variables[i];
        cells_.emplace_back(variable, options_, groups_.addsPrinted);
        texts_.push_back(totalFormatter(variable.field, textOptions_, groups_, i));
    }
    for (int i = 0; i < table.GetFieldsCount(); ++i) {
        fields_.push_back(table.GetField(i));
        const sXmlReportField &field = fields_.back();
        fieldFormatters_.emplace_back(field);
        std::optional<std::size_t> shown;
        for (std::size_t variable = 0; variable < groups_.variables.size(); ++variable) {
            const bool isFirst = std::find(variableOf_.begin(), variableOf_.end(), variable) == variableOf_.end();
            if (isFirst && equalFolded(groups_.variables[variable].field.VariableName, field.VariableName)) {
                shown = variable;
            }
        }
        variableOf_.push_back(shown);
        columns_.push_back(totalFormatter(field, options_, groups_, shown));
    }
}

void GroupedTable::write(const Rows &rows)
{
    lines_.setHooks({rows.placeHeading,
                     [this, &rows](const KeptLines::Line &line) {
                         rows.rowWritten(line.row);
                         countPageRow(line);
                     },
                     [this] { return pageEnd(); }, [this] { clearPage(); }},
                    pageEndHeight());
    const std::size_t levels = groups_.levels.size();
    const quint64 losses = page_.losses();
    for (quint64 row = 0; page_.losses() == losses; ++row) {
        const UDataObject *object = rows.list.GetAt(row);
        if (object == nullptr) {
            break;
        }
        const std::size_t first = row == 0 ? 0 : list_.firstNewLevel();
        if (row != 0 && first < levels) {
            endGroups(first);
        }
        beginGroups(first, *object);
        addRow(*object, rows.textOf(*object, row), row);
        if (givesResults()) {
            results_->addRow(*object, static_cast<int>(first));
        }
    }
    if (tableRows_ != 0) {
        endGroups(0);
        giveTotals({ResultRowKind::Total, ResultRow::noLevel}, groups_.tableTotals, totals_.front(), tableRows_,
                   nullptr);
        lines_.finish(linesOf(groups_.tableTotals, totals_.front(), tableRows_, nullptr));
    }
    remarks_.setMissingLines(page_.lineCount());
    list_.noteLeftOut(std::move(leftOut_));
}

void GroupedTable::beginGroups(std::size_t first, const UDataObject &object)
{
    const bool beginsPage =
        std::any_of(groups_.levels.begin() + static_cast<std::ptrdiff_t>(first), groups_.levels.end(),
                    [](const GroupLevel &level) { return level.hasHeading && level.newPage; });
    bool isBound = tableRows_ != 0 && isKept(first) && !beginsPage;
    bool isFirst = true;
    afterHeading_ = false;
    for (std::size_t i = first; i < groups_.levels.size(); ++i) {
        const GroupLevel &level = groups_.levels[i];
        OpenGroup &group = open_[i];
        group.rows = 0;
        group.heading.reset();
        group.firstRow = object;
        if (!level.hasHeading) {
            continue;
        }
        KeptLines::Line line;
        line.isBound = isBound;
        line.beginsPage = beginsPage && isFirst; // the headings of the groups around it go with it
        line.before = level.before;
        line.group = static_cast<int>(i);
        if (level.heading.needsRows()) {
            group.heading = lines_.addOpen(line);
            group.headingResult = givesResults() ? results_->addOpen(line.group) : 0;
        } else {
            const QString text = textOf(level.heading, totals_[i + 1], 0, &group.firstRow);
            lines_.add(line, text);
            if (givesResults()) {
                results_->addText(ResultText::GroupHeading, text, line.group);
            }
        }
        isBound = true;
        isFirst = false;
        afterHeading_ = true;
    }
}

/// Ends the groups of a level and of those inside it: their totals follow, and join those of the groups around them.
void GroupedTable::endGroups(std::size_t first)
{
    for (std::size_t i = groups_.levels.size(); i-- > first;) {
        const GroupLevel &level = groups_.levels[i];
        const OpenGroup &group = open_[i];
        Totals &totals = totals_[i + 1];
        KeptLines::Line line;
        line.isBound = true;
        for (const QString &text : linesOf(level.totals, totals, group.rows, &group.firstRow)) {
            lines_.add(line, text);
        }
        giveTotals({ResultRowKind::GroupFooter, static_cast<int>(i)}, level.totals, totals, group.rows,
                   &group.firstRow);
        if (group.heading) {
            const QString text = textOf(level.heading, totals, group.rows, &group.firstRow);
            lines_.setText(*group.heading, text);
            if (givesResults()) {
                results_->setText(group.headingResult, text);
            }
        }
        addTo(totals_[i], totals);
        for (ColumnTotal &total : totals) {
            total.clear();
        }
    }
}

void GroupedTable::addTo(Totals &totals, const Totals &other)
{
    for (std::size_t i = 0; i < totals.size(); ++i) {
        totals[i].add(other[i]);
    }
}

/// Whether what comes next stays with the line before it, as the first rows under a heading of the outer levels do.
bool GroupedTable::isKept(std::size_t levels) const
{
    for (std::size_t i = 0; i < levels; ++i) {
        const GroupLevel &level = groups_.levels[i];
        if (level.hasHeading && open_[i].rows < static_cast<quint64>(level.keep)) {
            return true;
        }
    }
    return false;
}

void GroupedTable::addRow(const UDataObject &object, QStringView text, quint64 row)
{
    KeptLines::Line line;
    line.isBound = afterHeading_ || (tableRows_ != 0 && isKept(open_.size()));
    line.row = row + 1;
    line.hasRemarks = remarks_.takeNew();
    remarks_.rows = row + 1;
    lines_.add(line, text);
    afterHeading_ = false;
    addValues(object, row);
    ++tableRows_;
    for (OpenGroup &group : open_) {
        ++group.rows;
    }
}

void GroupedTable::addValues(const UDataObject &object, quint64 row)
{
    for (std::size_t i = 0; i < cells_.size(); ++i) {
        const TotalledCell::Value value =
            cells_[i].read(object.Find(static_cast<quint32>(groups_.variables[i].field.ID)));
        if (value.state == TotalledCell::State::Missing || value.state == TotalledCell::State::NotFinite) {
            leftOut_[i].add(value.state == TotalledCell::State::Missing, row + 1);
        }
        cells_[i].add(totals_.back()[i], value);
        if (!groups_.pageTotals.empty()) {
            waiting_.push_back(value);
        }
    }
}

/// Takes note of the place of a row.
void GroupedTable::countPageRow(const KeptLines::Line &line)
{
    if (line.hasRemarks || line.row == wideTotalRow_) {
        remarks_.setLineOf(line.row, page_.lineCount());
    }
    ++pageRows_;
    if (groups_.pageTotals.empty()) {
        return;
    }
    for (std::size_t i = 0; i < cells_.size(); ++i) {
        cells_[i].add(pageTotals_[i], waiting_[nextWaiting_ + i]);
    }
    nextWaiting_ += cells_.size();
    if (nextWaiting_ == waiting_.size()) {
        waiting_.clear();
        nextWaiting_ = 0;
    }
}

std::vector<QString> GroupedTable::pageEnd()
{
    return pageRows_ == 0 ? std::vector<QString>() : linesOf(groups_.pageTotals, pageTotals_, pageRows_, nullptr);
}

void GroupedTable::clearPage()
{
    pageRows_ = 0;
    for (ColumnTotal &total : pageTotals_) {
        total.clear();
    }
}

} // namespace kareport

#include "LandXmlChoice.h"

#include "LandXmlQueryReader.h"
#include "PlainWidgets.h"
#include "Xlate.h"

#include <QComboBox>
#include <QDoubleSpinBox>
#include <QFormLayout>
#include <QLabel>
#include <QSignalBlocker>

#include <algorithm>
#include <optional>

namespace kareport
{

namespace
{

const QString listEntry = QStringLiteral("list");
const QString intervalEntry = QStringLiteral("interval");
const QString alignmentEntry = QStringLiteral("alignment");
const QString gradeLineEntry = QStringLiteral("gradeLine");
const QString surfaceEntry = QStringLiteral("surface");

/// What a list is called, and whether a file has anything for it.
struct OfferedList
{
    LandXmlListKind kind;
    QString title;
    bool hasRows;
};

bool isAny(const std::vector<LandXmlNamed> &names)
{
    return std::any_of(names.begin(), names.end(), [](const LandXmlNamed &named) { return named.count > 0; });
}

/// Whether an alignment has something for a list.
bool hasRowsOf(LandXmlListKind kind, const LandXmlContents::Alignment &alignment)
{
    switch (kind) {
    case LandXmlListKind::Elements:
    case LandXmlListKind::Stations:
    case LandXmlListKind::OffsetsOf: return alignment.elements > 0;
    case LandXmlListKind::Profile: return isAny(alignment.gradeLines);
    case LandXmlListKind::CrossSections: return alignment.sections > 0;
    default: return true;
    }
}

bool anyHasRowsOf(LandXmlListKind kind, const LandXmlContents &contents)
{
    return std::any_of(contents.alignments.begin(), contents.alignments.end(),
                       [kind](const LandXmlContents::Alignment &alignment) { return hasRowsOf(kind, alignment); });
}

std::vector<OfferedList> listsOf(const LandXmlContents &contents)
{
    using Kind = LandXmlListKind;
    const bool hasElements = anyHasRowsOf(Kind::Elements, contents);
    return {
        {Kind::Points, Xlate("Points"), isAny(contents.groups)},
        {Kind::SurfacePoints, Xlate("Points of surfaces"), isAny(contents.surfaces)},
        {Kind::Parcels, Xlate("Parcels"), !contents.parcels.empty()},
        {Kind::Courses, Xlate("Sides of parcels"), isAny(contents.parcels)},
        {Kind::Alignments, Xlate("Alignments"), !contents.alignments.empty()},
        {Kind::Elements, Xlate("Elements of alignments"), hasElements},
        {Kind::Stations, Xlate("Stations"), hasElements},
        {Kind::Profile, Xlate("Profile"), anyHasRowsOf(Kind::Profile, contents)},
        {Kind::CrossSections, Xlate("Cross sections"), anyHasRowsOf(Kind::CrossSections, contents)},
        {Kind::OffsetsOf, Xlate("Points beside an alignment"), hasElements && isAny(contents.groups)},
    };
}

/// Whether a list is of one of the names of a key, the first where none is chosen; others are of all.
bool isOne(const QString &key, std::optional<LandXmlListKind> kind)
{
    const bool isAlong = kind == LandXmlListKind::Stations || kind == LandXmlListKind::OffsetsOf;
    return isAlong && (key == gradeLineEntry || key == surfaceEntry);
}

} // namespace

LandXmlChoice::LandXmlChoice(QFormLayout &form) : form_(form), list_(new QComboBox), interval_(new QDoubleSpinBox)
{
    const auto addRow = [&form](const QString &text, const QString &accessibleName, QWidget *widget) {
        auto *label = plainLabel(text);
        label->setBuddy(widget);
        widget->setAccessibleName(accessibleName);
        form.addRow(label, widget);
    };
    const auto addNames = [&](const QString &key, const QString &text, const QString &accessibleName) {
        names_.push_back({key, new QComboBox});
        addRow(text, accessibleName, names_.back().box);
    };
    addRow(Xlate("&List:"), Xlate("List"), list_);
    addNames(QStringLiteral("group"), Xlate("&Group:"), Xlate("Group"));
    addNames(QStringLiteral("parcel"), Xlate("&Parcel:"), Xlate("Parcel"));
    addNames(alignmentEntry, Xlate("&Alignment:"), Xlate("Alignment"));
    addNames(gradeLineEntry, Xlate("Grade li&ne:"), Xlate("Grade line"));
    addNames(surfaceEntry, Xlate("S&urface:"), Xlate("Surface"));
    addRow(Xlate("&Interval:"), Xlate("Interval"), interval_);
    constexpr double mostInterval = 1e6;
    interval_->setRange(0, mostInterval);
    interval_->setDecimals(3);
    interval_->setValue(20);
    interval_->setSpecialValueText(Xlate("none"));
    interval_->setToolTip(plainToolTip(Xlate("The distance of regular stations, in the unit of the file")));
    QObject::connect(list_, &QComboBox::currentIndexChanged, list_, [this] { showRows(); });
    QComboBox *alignment = boxOf(alignmentEntry); // the grade lines and the surfaces that are offered are its own
    QObject::connect(alignment, &QComboBox::currentIndexChanged, alignment, [this] { showRows(); });
    showRows();
}

void LandXmlChoice::offer(const LandXmlContents &contents)
{
    const QJsonObject chosen = keys();
    contents_ = contents;
    isOffered_ = true;
    {
        const QSignalBlocker blocker(list_);
        list_->clear();
        for (const OfferedList &list : listsOf(contents)) {
            if (list.hasRows) {
                list_->addItem(list.title, keyOf(list.kind).toString());
            }
        }
    }
    choose(chosen);
}

void LandXmlChoice::clear()
{
    isOffered_ = false;
    showRows();
}

bool LandXmlChoice::hasList() const
{
    return isOffered_ && list_->currentIndex() >= 0;
}

QString LandXmlChoice::listKey() const
{
    return list_->currentData().toString();
}

/// The names that a key of the list that is chosen may have.
QComboBox *LandXmlChoice::boxOf(const QString &key) const
{
    const auto row = std::find_if(names_.begin(), names_.end(), [&](const Names &names) { return names.key == key; });
    return row->box;
}

/// The names that the chosen list can be asked for. Grade lines and surfaces are those of the chosen alignment.
QStringList LandXmlChoice::namesOf(const QString &key) const
{
    const auto kind = landXmlListFromKey(listKey());
    QStringList names;
    const auto add = [&names](const std::vector<LandXmlNamed> &found) {
        for (const LandXmlNamed &named : found) {
            names.append(named.name);
        }
    };
    if (key == QStringLiteral("group")) {
        add(contents_.groups);
    } else if (key == QStringLiteral("parcel")) {
        add(contents_.parcels);
    } else if (kind == LandXmlListKind::SurfacePoints) {
        add(contents_.surfaces);
    }
    const QString chosen = boxOf(alignmentEntry)->currentData().toString();
    const bool isAlong = kind && landXmlKeysOf(*kind).contains(alignmentEntry);
    for (const LandXmlContents::Alignment &alignment : contents_.alignments) {
        const bool isOffered = isAlong && hasRowsOf(*kind, alignment);
        if (isOffered && key == alignmentEntry) {
            names.append(alignment.name);
        } else if (isOffered && (chosen.isEmpty() || chosen == alignment.name)) {
            add(key == gradeLineEntry                    ? alignment.gradeLines
                : key != surfaceEntry                    ? std::vector<LandXmlNamed>()
                : kind == LandXmlListKind::CrossSections ? alignment.surfacesAcross
                                                         : alignment.surfacesAlong);
        }
    }
    return names;
}

/// Shows the rows that the list has a use for, with the names for it.
void LandXmlChoice::showRows()
{
    const auto kind = landXmlListFromKey(listKey());
    const QStringList used = isOffered_ && kind ? landXmlKeysOf(*kind) : QStringList();
    form_.setRowVisible(list_, isOffered_);
    form_.setRowVisible(interval_, used.contains(intervalEntry));
    for (const Names &row : names_) {
        const QString chosen = row.box->currentData().toString();
        const QSignalBlocker blocker(row.box);
        row.box->clear();
        const QStringList names = namesOf(row.key);
        const bool isNeeded =
            kind == LandXmlListKind::OffsetsOf && row.key == alignmentEntry && contents_.alignments.size() > 1;
        if (!isNeeded) {
            row.box->addItem(isOne(row.key, kind) ? Xlate("(the first)") : Xlate("(all)"), QString());
        }
        for (const QString &name : names) {
            if (!name.isEmpty() && row.box->findData(name) < 0) {
                row.box->addItem(name, name);
            }
        }
        row.box->setCurrentIndex(std::max(0, row.box->findData(chosen)));
        form_.setRowVisible(row.box, used.contains(row.key));
    }
}

QJsonObject LandXmlChoice::keys() const
{
    const auto kind = landXmlListFromKey(listKey());
    if (!kind) {
        return {};
    }
    const QStringList used = landXmlKeysOf(*kind);
    QJsonObject keys = {{listEntry, listKey()}};
    for (const Names &row : names_) {
        if (const QString name = row.box->currentData().toString(); used.contains(row.key) && !name.isEmpty()) {
            keys.insert(row.key, name);
        }
    }
    if (used.contains(intervalEntry) && interval_->value() > 0) {
        keys.insert(intervalEntry, interval_->value());
    }
    return keys;
}

void LandXmlChoice::choose(const QJsonObject &keys)
{
    list_->setCurrentIndex(std::max(list_->count() > 0 ? 0 : -1, list_->findData(keys.value(listEntry).toString())));
    showRows();
    for (const Names &row : names_) {
        row.box->setCurrentIndex(std::max(0, row.box->findData(keys.value(row.key).toString())));
    }
    const auto kind = landXmlListFromKey(listKey());
    if (kind && keys.contains(listEntry) && landXmlKeysOf(*kind).contains(intervalEntry)) {
        interval_->setValue(keys.value(intervalEntry).toDouble());
    }
}

} // namespace kareport

#pragma once

#include "LandXmlContents.h"

#include <QJsonObject>
#include <QString>
#include <QStringList>

#include <vector>

class QComboBox;
class QDoubleSpinBox;
class QFormLayout;
class QWidget;

namespace kareport
{

/// Rows of a form that choose what is listed of a LandXML file: the list, and names that are in the file. Rows that the list has
/// no use for are hidden; all are until a file is offered.
class LandXmlChoice
{
public:
    /// Adds the rows at the end of a form, which owns their widgets and must outlive this object.
    explicit LandXmlChoice(QFormLayout &form);
    LandXmlChoice(const LandXmlChoice &) = delete;
    LandXmlChoice &operator=(const LandXmlChoice &) = delete;

    /// Offers the lists and the names of a file. What is chosen remains chosen where the file has it.
    void offer(const LandXmlContents &contents);
    /// Hides the rows.
    void clear();
    /// Whether a list can be chosen: false without a file, and of one that has none.
    bool hasList() const;

    /// The keys of a data set of a job that say what is chosen.
    QJsonObject keys() const;
    /// Chooses what such keys say, as far as the file has it.
    void choose(const QJsonObject &keys);

private:
    /// A row with names.
    struct Names
    {
        QString key;
        QComboBox *box;
    };

    QComboBox *boxOf(const QString &key) const;
    QStringList namesOf(const QString &key) const;
    QString listKey() const;
    void showRows();

    QFormLayout &form_;
    QComboBox *list_; ///< data: the key of the list
    std::vector<Names> names_;
    QDoubleSpinBox *interval_;
    LandXmlContents contents_;
    bool isOffered_ = false;
};

} // namespace kareport

#pragma once

#include "ImportDatabase.h"

#include <QJsonObject>
#include <QString>
#include <QWidget>

#include <functional>
#include <vector>

class QCheckBox;
class QComboBox;
class QFormLayout;
class QLineEdit;

namespace kareport
{

/// The fields that ask how data is read: of a text file delimiter, decimal sign, encoding, header row and order of the columns, of a
/// database the table, and of both the units of the numbers.
class ImportFields : public QWidget
{
public:
    explicit ImportFields(QWidget *parent = nullptr);

    /// Shows the fields that there is a use for.
    void showFor(bool isDatabase);
    /// Offers tables. The one that is chosen stays where it is among them, else the first one is.
    void offer(const std::vector<ImportTable> &tables);
    /// The table that is chosen; empty without one.
    QString table() const;

    /// The keys of a data set that say what is chosen, as far as they are not the defaults, without the table.
    QJsonObject keys(bool isDatabase) const;
    /// Chooses what such keys say. Who does it is not told.
    void put(const QJsonObject &keys);
    /// Whether a key of a data set is shown here, or with the columns.
    static bool isShown(const QString &key);

    /// Called when the user has chosen something. @param isOfColumns  the columns may be other ones now
    std::function<void(bool isOfColumns)> changed;
    /// Called when the user has chosen a table, which may be the one before.
    std::function<void()> tableChosen;

private:
    void tell(bool isOfColumns);
    void watch();

    QFormLayout *left_;
    QFormLayout *right_;
    QComboBox *table_;
    QComboBox *delimiter_;
    QComboBox *decimal_;
    QComboBox *encoding_;
    QCheckBox *header_;
    QLineEdit *order_;
    QComboBox *length_;
    QComboBox *area_;
    QComboBox *angle_;
    bool isFilling_ = false; ///< nobody chooses anything
};

} // namespace kareport

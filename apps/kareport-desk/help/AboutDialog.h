#pragma once

#include <QDialog>

namespace kareport
{

/// Which program this is: its version, how it was built, and the licences of what it is built with.
class AboutDialog : public QDialog
{
public:
    explicit AboutDialog(QWidget *parent = nullptr);
};

/// How the program was built, and the Qt that it runs with.
QString buildText();

} // namespace kareport

#pragma once

namespace monkey
{

class Chance;
class World;

// What a user does beside the reports: data that is imported and changed, units, notes, and templates.

/// What the keyboard writes into, and commands are for, may change.
void aimKeyboard(World &world);

/// Makes a report from data in the dialog for that, with choices at random. What is shown as fitting must give a report.
void importData(World &world, Chance &chance);
/// Another program changes the data of jobs.
void changeData(World &world, Chance &chance);
/// Chooses other units for the report in front.
void chooseUnits(World &world, Chance &chance);
/// Goes to the line or to the file of a note.
void goToNote(World &world, Chance &chance);
/// Works in the editor of a template, which may stay open.
void editTemplate(World &world, Chance &chance);

/// Writes templates and data of points below a folder, where they are not there yet.
void makePoints(const World &world);

} // namespace monkey

#pragma once

#include <QString>

#include <iterator>

// Steps of hosts and of users with reports and their views, for random tests.

enum class ReportOp
{
    // of a host
    WriteLine,
    Write,
    LineFeed,
    NewPage,
    Rows,
    Table,
    Block,
    Heading,
    HeaderFlag,
    LinesPerPage,
    SetData,
    Clear,
    RichText,
    RichTextOn,
    RichTextOff,
    Load,
    SaveAlone,
    SaveRichText,
    Open,
    ReloadRichText,
    // of users, in view `a`
    Type,
    LineEnd,
    Backspace,
    Delete,
    Cut,
    Paste,
    TypeOver,
    Undo,
    Redo,
    TakeAll,
    OpenView,
    CloseView,
    // of both
    Reload,
    // of what is opened and closed, and of what happens by itself
    HidePane,
    ShowPane,
    WriteUnseen,
    SetLongData,
    GoOn,
    NeedAll,
    OpenReport,
    CloseReport,
    count
};

inline constexpr const char *reportOpNames[] = {
    "WriteLine",   "Write",       "LineFeed",     "NewPage",      "Rows",       "Table",          "Block",
    "Heading",     "HeaderFlag",  "LinesPerPage", "SetData",      "Clear",      "RichText",       "RichTextOn",
    "RichTextOff", "Load",        "SaveAlone",    "SaveRichText", "Open",       "ReloadRichText", "Type",
    "LineEnd",     "Backspace",   "Delete",       "Cut",          "Paste",      "TypeOver",       "Undo",
    "Redo",        "TakeAll",     "OpenView",     "CloseView",    "Reload",     "HidePane",       "ShowPane",
    "WriteUnseen", "SetLongData", "GoOn",         "NeedAll",      "OpenReport", "CloseReport"};
static_assert(std::size(reportOpNames) == std::size_t(ReportOp::count));

/// What the numbers mean is brought into what there is, so that every step makes sense in every state.
struct ReportStep
{
    ReportOp op;
    int a;
    int b;
    int c;
    int report = 0; ///< which of those that are open
};

/// A step as a row of a test.
QString textOf(const ReportStep &step);

<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ja" sourcelanguage="en">
<context>
    <name>KaReport</name>
    <message>
        <location filename="../host/app/StandardText.cpp"/>
        <source>All Files (*.*)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../host/app/StandardText.cpp"/>
        <source>The file is too large to open.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../host/frame/UDocument.cpp"/>
        <source>Save changes to %1?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../host/frame/UDocument.cpp"/>
        <source>Untitled</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>an empty %1 ends its list: what follows in the list is not read</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>%1 is not read: a closing tag of that name stands before it</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>%1 is not read: its closing tag was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>%1 stands in another %1: the outer one is cut short at the first closing tag</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>"%1" is dropped with the short closing tag of %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>no template was read: a &lt;ReportTemplate&gt; element was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>%1 is read although it stands in a comment</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>%1 is no tag: a tag has no blanks and no attributes</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>the template has no &lt;Name&gt;, so nobody can choose it</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>a template named %1 stands before: the last one of a name is read</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>the template's own &lt;Name&gt; must stand before %1: this one was taken for it</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>the sort key %1 is not in the dictionary %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>no &lt;Separator&gt;: the character 0 stands between the columns</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>the dictionary has no &lt;DictionaryName&gt;</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>unknown type %1: the variable %2 is left out</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>the identifier %1 counts as %2: a whole number was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>the variable %1 stands twice in the dictionary: the last one counts</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>the variables %1 and %2 share the identifier %3</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>the table has no &lt;Name&gt;</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>the block has no &lt;Name&gt;</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>there is no dictionary named %1: %2 cannot be written</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>%1 has no fields</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>the dictionary has no variable %1: the column cannot be filled</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>the dictionary has no variable %1: the line repeats the value before it</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>the format %1 is beyond %2 characters</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>the label %1 is wider than its column of %2: the column takes its width</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>the alignment %1 counts as LEFT</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../templates/TemplateCheck.cpp"/>
        <source>%1 is printed as it stands</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../output/PdfExport.cpp"/>
        <source>the page has not been measured</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../output/PdfExport.cpp"/>
        <source>a font size of 1 point or more was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../output/PdfExport.cpp"/>
        <source>the margins leave no room on the page: smaller margins were expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../output/PdfExport.cpp"/>
        <source>the PDF library failed with error %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../output/PdfExport.cpp"/>
        <source>no fixed-pitch font was found: DejaVu Sans Mono, Liberation Mono or Hack was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../output/PdfExport.cpp"/>
        <source>the font file "%1" cannot be used</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../output/PdfExport.cpp"/>
        <source>stopped</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../output/PdfExport.cpp"/>
        <source>the lines %1 to %2 of the report become %3 when they are broken: they do not fit one page</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../output/PdfExport.cpp"/>
        <source>no font has the character "%1" (U+%2), first in line %3, %4 times in all</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../output/PdfExport.cpp"/>
        <source>no font has %1 other characters, %2 times in all</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../output/RichTextParser.cpp"/>
        <source>%1 bytes of data were expected behind \bin</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../output/RichTextParser.cpp"/>
        <source>a closing brace was expected: groups that are still open: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../output/RichTextParser.cpp"/>
        <source>at most %1 groups inside each other were expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../output/RichTextReader.cpp"/>
        <source>%1 was expected, with which a rich text begins</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../output/RichTextReader.cpp"/>
        <source>Pictures are not shown: %1.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../output/RichTextReader.cpp"/>
        <source>Embedded objects and drawings are not shown: %1.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../output/RichTextReader.cpp"/>
        <source>Footnotes and comments are not shown: %1.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../output/RichTextReader.cpp"/>
        <source>Page headers and footers are not shown: %1.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../report/UReportDoc.cpp"/>
        <source>Station</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../report/UReportDoc.cpp"/>
        <source>   Page:</source>
        <comment>Report Header</comment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../report/UReportDocFile.cpp"/>
        <source>RTF Files (*.rtf)|*.rtf|Report Files (*.rep)|*.rep|PDF (*.pdf)|*.pdf|</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../report/UReportDocFile.cpp"/>
        <source>Report Files (*.rep)|*.rep|RTF Files (*.rtf)|*.rtf|PDF (*.pdf)|*.pdf|</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Previous match</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Next match</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Match &amp;case</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>&amp;Whole word</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Close the find bar</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Find</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Text to find</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>Matches</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>No match</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>%1 of %2</source>
        <comment>number of a match, number of all matches</comment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/FindBar.cpp"/>
        <source>%1 in all</source>
        <comment>number of all matches</comment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageBar.cpp"/>
        <source>Go to page</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageBar.cpp"/>
        <source>Page to go to</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageBar.cpp"/>
        <source>Pages</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageBar.cpp"/>
        <source>&amp;Go to page</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageBar.cpp"/>
        <source>G&amp;o</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageBar.cpp"/>
        <source>of %1</source>
        <comment>number of pages</comment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageSetupDialog.cpp"/>
        <source>Page Setup</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageSetupForm.cpp"/>
        <source>P&amp;ortrait</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageSetupForm.cpp"/>
        <source>L&amp;andscape</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageSetupForm.cpp"/>
        <source>&amp;Printer:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageSetupForm.cpp"/>
        <source>Printer</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageSetupForm.cpp"/>
        <source>Orientation</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageSetupForm.cpp"/>
        <source>Margins</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageSetupForm.cpp"/>
        <source>&amp;Left:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageSetupForm.cpp"/>
        <source>&amp;Top:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageSetupForm.cpp"/>
        <source>&amp;Right:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageSetupForm.cpp"/>
        <source>&amp;Bottom:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageSetupForm.cpp"/>
        <source>Left margin</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageSetupForm.cpp"/>
        <source>Top margin</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageSetupForm.cpp"/>
        <source>Right margin</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageSetupForm.cpp"/>
        <source>Bottom margin</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageSetupForm.cpp"/>
        <source> mm</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageSetupForm.cpp"/>
        <source>Paper: %1 x %2 mm</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PageSetupForm.cpp"/>
        <source>These margins leave no room for text on the paper. Choose smaller margins.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PrintDialogs.cpp"/>
        <source>Print</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PrintDialogs.cpp"/>
        <source>Print Preview</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PrintProgress.cpp"/>
        <source>Printing</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PrintProgress.cpp"/>
        <source>Cancel</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PrintProgress.cpp"/>
        <source>Page %1 of %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/PrintTarget.cpp"/>
        <source>There is no room left for the pages.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/ReportEdit.cpp"/>
        <source>Report text</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>Page</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>Line</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>Line %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>Column</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>Column %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>Zoom</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>%1 %</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/ReportViewWidget.cpp"/>
        <source>%1 %</source>
        <comment>zoom in percent</comment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/UReportViewPrint.cpp"/>
        <source>The margins leave no room for text on the paper. Choose smaller margins under Page Setup.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/UReportViewPrint.cpp"/>
        <source>There is nothing to print on the chosen pages.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/UReportViewPrint.cpp"/>
        <source>The report has changed while it was printed, and nothing of it was sent to the printer. Print it again.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/UReportViewPrint.cpp"/>
        <source>The report could not be printed on "%1". Check the printer, or choose another one, and print again. Nothing of the report is lost.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/UReportViewPrint.cpp"/>
        <source>The preview shows the first %1 pages. All pages are printed.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../view/UReportViewPrint.cpp"/>
        <source>Failed to get default printer settings.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../ui/CReportToolBar.cpp"/>
        <source>Report</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../ui/CReportViewPane.cpp"/>
        <source>The Report can only be closed when the associated editor is closed</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../ui/CReportViewPane.cpp"/>
        <source>Error</source>
        <comment>Alert Message title</comment>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../ui/ReportResources.cpp"/>
        <source>KaReport</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../ui/ReportResources.cpp"/>
        <source>Save</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../ui/ReportResources.cpp"/>
        <source>View\Edit Report</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandSetup.cpp"/>
        <source>--as: one of %1 was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandSetup.cpp"/>
        <source>the ending of "%1" says no kind: --as with one of %2 was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/CommandSetup.cpp"/>
        <source>--set "%1": KEY=VALUE was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/ConvertCommand.cpp"/>
        <source>a saved report was expected; this is a PDF</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/ConvertCommand.cpp"/>
        <source>a report file was expected; this is no UTF-8</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/ConvertCommand.cpp"/>
        <source>--set "%1": a key of the page was expected, as page.linesPerPage=60</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/ConvertCommand.cpp"/>
        <source>--set: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/ConvertCommand.cpp"/>
        <source>kareport: warning: "%1": %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/CsvObjectList.cpp"/>
        <source>a header row of variable names was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/CsvObjectList.cpp"/>
        <source>the column "%1" stands twice: each variable was expected once</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/CsvObjectList.cpp"/>
        <source>no column of the header row is a variable of the dictionary: a header row of variable names, with the data's delimiter between them, was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/CsvObjectList.cpp"/>
        <source>the row has %1 cells: %2 were expected, as in the header row</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/CsvObjectList.cpp"/>
        <source>the cell "%1" of the column "%2" does not fit: %3 was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/CsvReader.cpp"/>
        <source>the file is not UTF-8</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/CsvReader.cpp"/>
        <source>a delimiter was expected behind the closing quote</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/CsvReader.cpp"/>
        <source>a quote inside a cell was not expected: the whole cell must stand in quotes and the quote be doubled</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/CsvReader.cpp"/>
        <source>a zero byte stands in the file: a text file was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/CsvReader.cpp"/>
        <source>the quoted cell has no closing quote</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/CsvReader.cpp"/>
        <source>a carriage return without a line feed was not expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/CsvReader.cpp"/>
        <source>the row is longer than %1 bytes: a table of rows was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/FileBytes.cpp"/>
        <source>more than %1 MB come out of what is no file</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobReader.cpp"/>
        <source>one of %1 was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobReader.cpp"/>
        <source>a list of four margins (left, top, right, bottom) was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobReader.cpp"/>
        <source>a character code or a text of one character was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobReader.cpp"/>
        <source>either "csv" or "values" was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobReader.cpp"/>
        <source>an object or a list of objects was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobReader.cpp"/>
        <source>a text of one ASCII character that is neither a quote nor a line end was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobReader.cpp"/>
        <source>true was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobReader.cpp"/>
        <source>a step was expected: one of heading, line, lineFeed, newPage, block, table, clear</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobReader.cpp"/>
        <source>a "%1" needs a template: the key "template" was expected in the job</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobReader.cpp"/>
        <source>the key "data" with the name of a data set was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobReader.cpp"/>
        <source>there is no data set named "%1" in the job</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobReader.cpp"/>
        <source>the key "report" with a list of steps was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobReader.cpp"/>
        <source>the key "file" was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobReader.cpp"/>
        <source>the ending of "%1" says no kind: the key "as" with one of %2 was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobReader.cpp"/>
        <source>a text that begins with "%1" was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobReader.cpp"/>
        <source>a date and time such as 2024-03-05T14:07:00 was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobReader.cpp"/>
        <source>the key "%1" with a text was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobRunner.cpp"/>
        <source>block</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobRunner.cpp"/>
        <source>table</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobRunner.cpp"/>
        <source>the template has no %1 named "%2": one of %3 was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobRunner.cpp"/>
        <source>none</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobRunner.cpp"/>
        <source>the %1 "%2" cannot be written: the template has no dictionary named "%3"</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobRunner.cpp"/>
        <source>the %1 "%2" cannot be written: the format of its field "%3" is beyond %4 characters</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobRunner.cpp"/>
        <source>the data file "%1" cannot be read: %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobRunner.cpp"/>
        <source>Reading %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobRunner.cpp"/>
        <source>the data "%1" has no row: a block shows the first one</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobRunner.cpp"/>
        <source>a row was expected behind the header row: a block shows the first one</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobRunner.cpp"/>
        <source>the report could not be made</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobRunner.cpp"/>
        <source>the margins leave no room on the page: smaller margins or a smaller font were expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobRunner.cpp"/>
        <source>there is no template file "%1"</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobSettingsReader.cpp"/>
        <source>a list of three texts was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JobSettingsReader.cpp"/>
        <source>one character with a code up to 255, or an empty text, was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JsonNode.cpp"/>
        <source>the file cannot be read: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JsonNode.cpp"/>
        <source>the file is larger than %1 MB: a job was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JsonNode.cpp"/>
        <source>a JSON object was expected: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JsonNode.cpp"/>
        <source>a JSON object was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JsonNode.cpp"/>
        <source>there is no place for the key "%1" in the job</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JsonNode.cpp"/>
        <source>a text was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JsonNode.cpp"/>
        <source>true or false was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JsonNode.cpp"/>
        <source>a whole number from %1 to %2 was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JsonNode.cpp"/>
        <source>an object was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JsonNode.cpp"/>
        <source>a list was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JsonNode.cpp"/>
        <source>unknown key "%1": %2 expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JsonObjectList.cpp"/>
        <source>the variable "%1" stands twice: each variable was expected once</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/JsonObjectList.cpp"/>
        <source>the value of "%1" does not fit: %2 was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/OutputWriter.cpp"/>
        <source>the report could not be written to standard output: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/OutputWriter.cpp"/>
        <source>"%1" could not be written: %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/OutputWriter.cpp"/>
        <source>the report begins as rich text, but %1 (line %2, column %3)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/OutputsWriter.cpp"/>
        <source>kareport: stopped before "%1" was written</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/OutputsWriter.cpp"/>
        <source>Writing %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/OutputsWriter.cpp"/>
        <source>kareport: the report is empty: "%1" was not written</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderCommand.cpp"/>
        <source>either a job file or --template, --name, --table or --block, and --data were expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderCommand.cpp"/>
        <source>--template, --name, --data and one of --table and --block were expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/RenderCommand.cpp"/>
        <source>kareport: stopped; nothing was written</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/RowBatches.cpp"/>
        <source>there is not enough memory for the data</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/TemplateSource.cpp"/>
        <source>the template file cannot be read: there is no such file</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/TemplateSource.cpp"/>
        <source>a template file was expected; this is a folder, a pipe or a device</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/TemplateSource.cpp"/>
        <source>the template file has %1 MB: at most %2 MB were expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/TemplateSource.cpp"/>
        <source>the template file cannot be read</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/TemplateSource.cpp"/>
        <source>the template file is empty: a &lt;ReportTemplate&gt; element was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/TemplateSource.cpp"/>
        <source>the template "%1" cannot be loaded: %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/TemplateSource.cpp"/>
        <source>the file holds no template: a &lt;ReportTemplate&gt; element was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/TemplateSource.cpp"/>
        <source>there is no template named "%1": one of %2 was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/ValueParser.cpp"/>
        <source>a whole number</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/ValueParser.cpp"/>
        <source>a text</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/ValueParser.cpp"/>
        <source>yes or no</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/ValueParser.cpp"/>
        <source>a station such as 12+345.678</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/ValueParser.cpp"/>
        <source>an angle such as 45-30-15</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/ValueParser.cpp"/>
        <source>a number</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/ViewCommand.cpp"/>
        <source>there is no file "%1"</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/ViewCommand.cpp"/>
        <source>the program kareport-desk is not installed</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/ViewCommand.cpp"/>
        <source>there is no display to show a window on: DISPLAY or WAYLAND_DISPLAY was expected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport/ViewCommand.cpp"/>
        <source>"%1" could not be started</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskDialogs.cpp"/>
        <source>Save As</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrame.cpp"/>
        <source>Open a job or a saved report, or drop it here.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrame.cpp"/>
        <source>Open</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrame.cpp"/>
        <source>Reports, jobs and templates (*.rep *.rtf *.json *.xml)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrame.cpp"/>
        <source>All files (*)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrame.cpp"/>
        <source>There is no file "%1".</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrame.cpp"/>
        <source>"%1" could not be opened.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrame.cpp"/>
        <source> (with changes that were not saved)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrame.cpp"/>
        <source>KaReport did not end properly the last time. These reports were open:

%1

Open them again?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrame.cpp"/>
        <source>"%1" was changed by another program, and it has changes here that are not saved. Load it again and lose the changes made here?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrame.cpp"/>
        <source>"%1" was changed by another program. Load it again?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrame.cpp"/>
        <source>About KaReport</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrame.cpp"/>
        <source>KaReport: fixed-pitch reports for civil engineering and surveying.

Open a job (.json) to run it, or a saved report (.rep, .rtf) to read, edit and print it. Ctrl+F finds text, Ctrl+G goes to a page, Ctrl+wheel zooms.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;File</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;New	Ctrl+N</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>New from &amp;Template...	Ctrl+T</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Open...	Ctrl+O</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Close	Ctrl+W</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Save	Ctrl+S</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Save &amp;As...	Ctrl+Shift+S</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Update Text</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Print...	Ctrl+P</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Print Pre&amp;view</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Pa&amp;ge Setup...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Recent File</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>E&amp;xit	Ctrl+Q</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Edit</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Undo	Ctrl+Z</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Redo	Ctrl+Shift+Z</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Cu&amp;t	Ctrl+X</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Copy	Ctrl+C</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Paste	Ctrl+V</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Select &amp;All	Ctrl+A</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Find...	Ctrl+F</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Find &amp;Next	F3</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Find Pre&amp;vious	Shift+F3</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Go to Page...	Ctrl+G</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Pr&amp;eferences...	Ctrl+,</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;View</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Toolbar</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Status Bar</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Zoom &amp;In	Ctrl++</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Zoom &amp;Out	Ctrl+-</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Usual Size	Ctrl+0</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Window</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;New Window</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Cascade</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Tile Horizontally</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Tile Vertically</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Arrange Icons</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Help</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;Help	F1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>&amp;About...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/DeskFrameMenus.cpp"/>
        <source>Toolbar</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>&amp;Show reports in this program:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>Bro&amp;wse...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>Program that shows reports</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>Choose a program, or clear the box above.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>There is no program "%1". Choose one from the list, or with Browse.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>Choose a program</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>Reports are shown in their own window.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>It gets reports as rich text.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/EditorPage.cpp"/>
        <source>It gets reports as plain text.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/JobLauncher.cpp"/>
        <source>There is not enough memory for this input.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Preferences</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source> pt</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Font size</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>&amp;Font size of new reports:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>As the system</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>Language</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>&amp;Language (from the next start):</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>&amp;Units and Formats</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>&amp;Page</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>&amp;Editor</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/PreferencesDialog.cpp"/>
        <source>P&amp;rogram</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Report from Template</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Choose a template file</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Brow&amp;se...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Choose a data file</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Template file</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Template</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Table or block</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Data file</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>&amp;File:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>&amp;Template:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Table or &amp;block:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>&amp;Data (CSV):</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Templates (*.xml);;All files (*)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>Data (*.csv *.txt);;All files (*)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>This template has neither a table nor a block.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/TemplateDialog.cpp"/>
        <source>There is no data file "%1".</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Metre</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Millimetre</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Kilometre</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>International foot</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>US survey foot</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Square metre</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Hectare</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Square kilometre</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Square foot</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Acre</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Degree</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Gon</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Radian</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Easting, northing</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Northing, easting</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Degrees, minutes, seconds</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Decimal degrees</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Whole circle</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Quadrant</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>From north</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>From south</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Leading &amp;zeros</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>&amp;Lengths:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Decimals:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>&amp;Areas:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Decimals of numbers:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>A&amp;ngles:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>&amp;Stations:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>&amp;Coordinates:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>&amp;Bearings:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Degree mark</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Minute mark</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Second mark</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Angle &amp;marks:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Looks like</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Unit of lengths</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Decimals of lengths</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Unit of areas</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Decimals of numbers and areas</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Unit of angles</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Form of stations</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Decimals of stations</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Order of coordinates</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Unit of bearings</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Decimals of bearings</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Style of bearings</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Reference of bearings</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Length</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Area</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Angle</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Bearing</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>Columns</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>E, N</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/UnitsPage.cpp"/>
        <source>N, E</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/main.cpp"/>
        <source>Runs report jobs, and shows, edits and prints reports.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../apps/kareport-desk/main.cpp"/>
        <source>Jobs (.json) and saved reports (.rep, .rtf) to open</source>
        <translation type="unfinished"></translation>
    </message>
</context>
</TS>
